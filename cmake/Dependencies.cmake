find_package(wxWidgets 3.2 REQUIRED COMPONENTS core xml base)

# Programs here are for a console unless they say otherwise, whatever wxWidgets expects.
list(FILTER wxWidgets_LIBRARIES EXCLUDE REGEX "subsystem,windows|-mwindows")

# wxWidgets as one target; its headers are not ours to warn about.
add_library(wxwidgets INTERFACE)
separate_arguments(wx_flags NATIVE_COMMAND "${wxWidgets_CXX_FLAGS}")
target_compile_options(wxwidgets INTERFACE ${wx_flags})
target_compile_definitions(wxwidgets INTERFACE ${wxWidgets_DEFINITIONS})
target_include_directories(wxwidgets SYSTEM INTERFACE ${wxWidgets_INCLUDE_DIRS})
target_link_libraries(wxwidgets INTERFACE ${wxWidgets_LIBRARIES})

if(WIN32)
    include(cmake/WindowsDependencies.cmake)
else()
    find_package(PkgConfig REQUIRED)
    pkg_check_modules(GSF REQUIRED IMPORTED_TARGET libgsf-1)
    pkg_check_modules(POPPLER REQUIRED IMPORTED_TARGET poppler-glib)
    pkg_check_modules(CAIRO REQUIRED IMPORTED_TARGET cairo-ps)
    pkg_check_modules(PANGO REQUIRED IMPORTED_TARGET pangocairo)
    find_package(Cups REQUIRED)
    find_package(CLI11 REQUIRED)
    find_package(nlohmann_json REQUIRED)
    if(QUILLON_TESTS OR QUILLON_BENCHMARKS)
        find_package(GTest REQUIRED)
    endif()
    include(cmake/LibreOffice.cmake)
endif()
