# LibreOffice as a library: its C interface, and the C++ headers of its component model, which are
# made from its type libraries. Only what a program includes is made, with what that includes.
find_path(LIBREOFFICE_SDK include/sal/types.h
    PATHS /usr/lib/libreoffice/sdk /opt/libreoffice/sdk REQUIRED)
find_path(LIBREOFFICEKIT_INCLUDE LibreOfficeKit/LibreOfficeKit.h REQUIRED)
find_program(CPPUMAKER cppumaker HINTS "${LIBREOFFICE_SDK}/bin" REQUIRED)
find_path(LIBREOFFICE_PROGRAM types/offapi.rdb HINTS "${LIBREOFFICE_SDK}/../program" REQUIRED)

set(uno_types
    com.sun.star.beans.PropertyValue
    com.sun.star.beans.XPropertySet
    com.sun.star.container.XNameReplace
    com.sun.star.document.MacroExecMode
    com.sun.star.drawing.XDrawPagesSupplier
    com.sun.star.frame.XComponentLoader
    com.sun.star.frame.XStorable
    com.sun.star.lang.XMultiServiceFactory
    com.sun.star.lang.XTypeProvider
    com.sun.star.task.ErrorCodeIOException
    com.sun.star.uno.DeploymentException
    com.sun.star.uno.XAggregation
    com.sun.star.uno.XComponentContext
    com.sun.star.uno.XWeak
    com.sun.star.util.XChangesBatch)
set(uno_headers "${CMAKE_BINARY_DIR}/uno")
set(uno_stamp "${uno_headers}/made")
add_custom_command(
    OUTPUT "${uno_stamp}"
    COMMAND "${CMAKE_COMMAND}" -E make_directory "${uno_headers}"
    COMMAND "${CPPUMAKER}" -Gc "-O${uno_headers}" "-T${uno_types}"
            "${LIBREOFFICE_PROGRAM}/types.rdb" "${LIBREOFFICE_PROGRAM}/types/offapi.rdb"
    COMMAND "${CMAKE_COMMAND}" -E touch "${uno_stamp}"
    DEPENDS "${LIBREOFFICE_PROGRAM}/types.rdb" "${LIBREOFFICE_PROGRAM}/types/offapi.rdb"
            "${CMAKE_CURRENT_LIST_FILE}"
    COMMENT "Making the headers of LibreOffice's types"
    VERBATIM)
add_custom_target(uno_headers DEPENDS "${uno_stamp}")

add_library(libreoffice INTERFACE)
add_dependencies(libreoffice uno_headers)
target_include_directories(libreoffice SYSTEM INTERFACE
    "${uno_headers}" "${LIBREOFFICE_SDK}/include" "${LIBREOFFICEKIT_INCLUDE}")
target_compile_definitions(libreoffice INTERFACE CPPU_ENV=gcc3 LINUX UNX LOK_USE_UNSTABLE_API)
# What those of the SDK need in turn lies with the program.
target_link_options(libreoffice INTERFACE "-Wl,-rpath-link,${LIBREOFFICE_PROGRAM}")
target_link_libraries(libreoffice INTERFACE
    "${LIBREOFFICE_SDK}/lib/libuno_cppu.so"
    "${LIBREOFFICE_SDK}/lib/libuno_cppuhelpergcc3.so"
    "${LIBREOFFICE_SDK}/lib/libuno_sal.so"
    ${CMAKE_DL_LIBS})
