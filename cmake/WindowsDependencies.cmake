# What Debian has as packages for Linux only. The headers of the first four are all of them.
foreach(library CLI11::CLI11 nlohmann_json::nlohmann_json PkgConfig::HTTPLIB PkgConfig::TOML
                PkgConfig::PROMETHEUS PkgConfig::SQLITE)
    add_library(${library} INTERFACE IMPORTED)
    target_include_directories(${library} SYSTEM INTERFACE "${QUILLON_WINDOWS_LIBRARIES}/include")
endforeach()
target_link_libraries(PkgConfig::HTTPLIB INTERFACE ws2_32)
target_link_libraries(PkgConfig::PROMETHEUS INTERFACE
    "${QUILLON_WINDOWS_LIBRARIES}/lib/libprometheus-cpp-core.a")
target_compile_definitions(PkgConfig::PROMETHEUS INTERFACE PROMETHEUS_CPP_CORE_STATIC_DEFINE)
target_link_libraries(PkgConfig::SQLITE INTERFACE "${QUILLON_WINDOWS_LIBRARIES}/lib/libsqlite3.a")

set(INSTALL_GTEST OFF)
add_subdirectory(/usr/src/googletest "${CMAKE_BINARY_DIR}/googletest" EXCLUDE_FROM_ALL)

# The libraries lie beside the program, as on a machine where it is installed.
file(GLOB libraries
    "${QUILLON_WINDOWS_LIBRARIES}/bin/wxbase32u_*.dll"
    "${QUILLON_WINDOWS_LIBRARIES}/bin/wxmsw32u_core_*.dll")
foreach(name libstdc++-6.dll libgcc_s_seh-1.dll libwinpthread-1.dll zlib1.dll)
    execute_process(COMMAND "${CMAKE_CXX_COMPILER}" -print-file-name=${name}
                    OUTPUT_VARIABLE path OUTPUT_STRIP_TRAILING_WHITESPACE)
    list(APPEND libraries "${path}")
endforeach()
file(COPY ${libraries} DESTINATION "${QUILLON_BIN}")
