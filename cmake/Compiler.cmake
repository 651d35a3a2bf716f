# Warnings are errors, in everything that is ours. Linked by each target of the project.
add_library(project_options INTERFACE)
target_compile_options(project_options INTERFACE
    -Wall -Wextra -Wpedantic -Werror
    -Wshadow -Woverloaded-virtual -Wcast-qual -Wformat=2
    -Wimplicit-fallthrough -Wextra-semi -Wundef -Wvla)
if(NOT WIN32) # whose COM interfaces have none
    target_compile_options(project_options INTERFACE -Wnon-virtual-dtor)
endif()
# A log record names its source file as it stands in the project, wherever that was built.
target_compile_options(project_options INTERFACE "-fmacro-prefix-map=${PROJECT_SOURCE_DIR}/=")
target_compile_definitions(project_options INTERFACE UNICODE _UNICODE)
target_include_directories(project_options INTERFACE "${PROJECT_SOURCE_DIR}")

if(QUILLON_SANITIZE)
    add_compile_options(-fsanitize=${QUILLON_SANITIZE} -fno-omit-frame-pointer
                        -fno-sanitize-recover=all)
    add_link_options(-fsanitize=${QUILLON_SANITIZE})
    target_sources(project_options INTERFACE
        $<$<STREQUAL:$<TARGET_PROPERTY:TYPE>,EXECUTABLE>:${PROJECT_SOURCE_DIR}/cmake/LeakSanitizer.cpp>)
endif()

# Takes the sanitizers from a target whose code runs in a program that has none.
function(without_sanitizers target)
    if(QUILLON_SANITIZE)
        target_compile_options(${target} PRIVATE -fno-sanitize=all)
        target_link_options(${target} PRIVATE -fno-sanitize=all)
    endif()
endfunction()

# Compiles sources without optimization: those that read a command line, which happens once, by a
# library of templates, which takes three times as long to optimize.
function(compile_quickly)
    set_source_files_properties(${ARGN} PROPERTIES
        COMPILE_OPTIONS -O0 SKIP_PRECOMPILE_HEADERS ON)
endfunction()

find_program(CCACHE ccache)
if(CCACHE)
    # It looks into precompiled headers only when it is told that they may be trusted.
    set(CMAKE_CXX_COMPILER_LAUNCHER "${CMAKE_COMMAND}" -E env
        CCACHE_SLOPPINESS=pch_defines,time_macros "${CCACHE}")
endif()
