# The Debian package, by `cpack`: what cmake --install has, and what makes a service of it. Files with
# a place of their own in the system are only in the package, as the component "system".
foreach(page quillon.1 quillon-watch.5)
    string(REGEX REPLACE ".*\\." "" section "${page}")
    set(compressed "${CMAKE_BINARY_DIR}/man/${page}.gz")
    add_custom_command(OUTPUT "${compressed}"
        COMMAND gzip -9nc "${PROJECT_SOURCE_DIR}/docs/man/${page}" > "${compressed}"
        DEPENDS "${PROJECT_SOURCE_DIR}/docs/man/${page}" VERBATIM)
    list(APPEND pages "${compressed}")
    install(FILES "${compressed}" DESTINATION "${CMAKE_INSTALL_MANDIR}/man${section}")
endforeach()
file(MAKE_DIRECTORY "${CMAKE_BINARY_DIR}/man")
add_custom_target(man DEPENDS ${pages})
add_dependencies(program man)

set(packaging "${PROJECT_SOURCE_DIR}/packaging")
install(FILES "${packaging}/quillon.bash" RENAME quillon
        DESTINATION "${CMAKE_INSTALL_DATADIR}/bash-completion/completions")

set(changelog_date "Wed, 25 Nov 2026 12:00:00 +0000")
set(CPACK_DEBIAN_PACKAGE_MAINTAINER "Quillon <maintainers@quillon.invalid>")
configure_file("${packaging}/debian/changelog.in" "${CMAKE_BINARY_DIR}/packaging/changelog" @ONLY)
install(CODE "
    foreach(file \"${CMAKE_BINARY_DIR}/packaging/changelog\" \"${PROJECT_SOURCE_DIR}/CHANGELOG.md\")
        cmake_path(GET file FILENAME name)
        execute_process(COMMAND gzip -9nc \"\${file}\" COMMAND_ERROR_IS_FATAL ANY
                        OUTPUT_FILE \"${CMAKE_BINARY_DIR}/packaging/\${name}.gz\")
    endforeach()" COMPONENT system EXCLUDE_FROM_ALL)
install(FILES "${packaging}/debian/copyright" "${CMAKE_BINARY_DIR}/packaging/changelog.gz"
              "${CMAKE_BINARY_DIR}/packaging/CHANGELOG.md.gz"
        DESTINATION /usr/share/doc/quillon COMPONENT system EXCLUDE_FROM_ALL)
install(FILES "${packaging}/watch.toml"
        DESTINATION /etc/quillon COMPONENT system EXCLUDE_FROM_ALL)
# There may be a password in it; the installation gives it to the service's group.
install(FILES "${packaging}/serve.toml" PERMISSIONS OWNER_READ OWNER_WRITE GROUP_READ
        DESTINATION /etc/quillon COMPONENT system EXCLUDE_FROM_ALL)
install(FILES "${packaging}/quillon.service" "${packaging}/quillon-serve.service"
        DESTINATION /lib/systemd/system COMPONENT system EXCLUDE_FROM_ALL)
install(FILES "${packaging}/sysusers.conf" RENAME quillon.conf
        DESTINATION /usr/lib/sysusers.d COMPONENT system EXCLUDE_FROM_ALL)

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME quillon)
set(CPACK_PACKAGE_VERSION "${PROJECT_VERSION}")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "Office documents into files ready for print, by watched folders")
set(CPACK_PACKAGE_DESCRIPTION "Takes Word, Excel, PowerPoint and Publisher documents, prints each into
a PostScript file, and makes PDF files of it. Documents are given on a
command line, or put into folders that a service watches.
.
LibreOffice and Ghostscript do the work, each document locked in: it
reaches no file but itself, no network and no other process.")
set(CPACK_DEBIAN_PACKAGE_SECTION text)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)
foreach(application writer calc impress draw)
    list(APPEND depends "libreoffice-${application}-nogui | libreoffice-${application}")
endforeach()
list(APPEND depends ghostscript procps "systemd | systemd-standalone-sysusers | systemd-sysusers")
list(JOIN depends ", " CPACK_DEBIAN_PACKAGE_DEPENDS)
set(CPACK_DEBIAN_PACKAGE_RECOMMENDS "fonts-crosextra-caladea, fonts-crosextra-carlito, \
fonts-dejavu-core, fonts-liberation")
set(CPACK_DEBIAN_PACKAGE_SUGGESTS cups)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS "${QUILLON_BIN}")
set(CPACK_DEBIAN_PACKAGE_CONTROL_EXTRA
    "${packaging}/debian/conffiles" "${packaging}/debian/postinst" "${packaging}/debian/postrm"
    "${packaging}/debian/prerm")
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)

# All in one package, whose files go where they are told relative to a folder that stands for /.
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_COMPONENTS_GROUPING ALL_COMPONENTS_IN_ONE)
set(CPACK_COMPONENTS_ALL Unspecified system)
set(CPACK_SET_DESTDIR ON)
set(CPACK_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CMAKE_SKIP_INSTALL_ALL_DEPENDENCY ON)
include(CPack)
