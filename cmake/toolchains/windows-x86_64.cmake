# Windows x86-64 by mingw-w64, with the threads that std::thread needs. The libraries without a
# Debian package for Windows come from the folder that scripts/windows/libraries fills.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)

set(mingw x86_64-w64-mingw32)
set(CMAKE_C_COMPILER ${mingw}-gcc-posix)
set(CMAKE_CXX_COMPILER ${mingw}-g++-posix)
set(CMAKE_RC_COMPILER ${mingw}-windres)

if(DEFINED ENV{XDG_CACHE_HOME})
    set(QUILLON_WINDOWS_LIBRARIES "$ENV{XDG_CACHE_HOME}/quillon/windows-x86_64")
else()
    set(QUILLON_WINDOWS_LIBRARIES "$ENV{HOME}/.cache/quillon/windows-x86_64")
endif()
set(wxWidgets_CONFIG_EXECUTABLE "${QUILLON_WINDOWS_LIBRARIES}/bin/wx-config")

# Nothing of the building machine's headers and libraries, whose names are often the same.
set(CMAKE_FIND_ROOT_PATH "${QUILLON_WINDOWS_LIBRARIES}" "/usr/${mingw}")
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)

# What the build makes is run under Wine, where the files of the building machine are drive Z:.
set(CMAKE_CROSSCOMPILING_EMULATOR
    "${CMAKE_CURRENT_LIST_DIR}/../../scripts/windows/run-program" "${CMAKE_BINARY_DIR}")
set(QUILLON_DRIVE "Z:")
