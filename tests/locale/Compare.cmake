# Fails when the catalogue lacks a text that the sources mark for translation, or one of another
# language's catalogue.
file(GLOB_RECURSE sources "${SOURCES}/*.cpp")
execute_process(COMMAND "${XGETTEXT}" --language=C++ --from-code=UTF-8
                        --keyword --keyword=_ --keyword=wxTRANSLATE --keyword=wxPLURAL:1,2
                        "--output=${TEXTS}" ${sources}
                RESULT_VARIABLE failed)
if(NOT failed)
    execute_process(COMMAND "${MSGCMP}" "${CATALOGUE}" "${TEXTS}" RESULT_VARIABLE failed)
endif()
if(NOT failed)
    execute_process(COMMAND "${MSGCMP}" "${CATALOGUE}" "${OTHER}" RESULT_VARIABLE failed)
endif()
if(failed)
    message(FATAL_ERROR "The catalogue ${CATALOGUE} is not complete.")
endif()
