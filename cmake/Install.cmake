# cmake --install: what a user runs, as the program expects it: one folder lib/quillon with the
# program, its libraries and the folders of its parts, and a link to the program in bin. It finds its
# own file through the link, and its libraries beside themselves, so the whole may be moved.
include(GNUInstallDirs)
set(folder "${CMAKE_INSTALL_LIBDIR}/quillon")

# install_parts(FOLDER RPATH TARGET…)
function(install_parts subfolder rpath)
    set_target_properties(${ARGN} PROPERTIES INSTALL_RPATH "${rpath}")
    install(TARGETS ${ARGN}
        RUNTIME DESTINATION "${folder}/${subfolder}"
        LIBRARY DESTINATION "${folder}/${subfolder}")
endfunction()

install_parts("" "\$ORIGIN" quillon WQServices Themer mfc win32)
install_parts(Filters "\$ORIGIN/.." MSOffice orv_dist)
install_parts(StandIns "\$ORIGIN/.." distiller distiller-engine office office-engine office-text
              pdf-to-ps)
install_parts(StandIns "" office-host) # it finds LibreOffice by its environment
install(DIRECTORY "${QUILLON_BIN}/JobOptions" "${QUILLON_BIN}/Printers" "${QUILLON_BIN}/locale"
        DESTINATION "${folder}")
install(CODE "
    set(bin \"\$ENV{DESTDIR}\${CMAKE_INSTALL_PREFIX}/${CMAKE_INSTALL_BINDIR}\")
    file(MAKE_DIRECTORY \"\${bin}\")
    file(CREATE_LINK \"../${folder}/quillon\" \"\${bin}/quillon\" SYMBOLIC)
    message(STATUS \"Installing: \${bin}/quillon\")")
