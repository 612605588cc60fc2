# A Linux machine's compiler for 64-bit Windows. NVLDM_WINDOWS_SYSROOT, of the cache or of the environment, names
# the folder into which Qt and the other libraries were installed.

set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_VERSION 10.0)
set(CMAKE_SYSTEM_PROCESSOR x86_64)

set(triplet x86_64-w64-mingw32)
set(CMAKE_C_COMPILER ${triplet}-gcc-posix)
set(CMAKE_CXX_COMPILER ${triplet}-g++-posix)
set(CMAKE_RC_COMPILER ${triplet}-windres)

if(NOT NVLDM_WINDOWS_SYSROOT)
    set(NVLDM_WINDOWS_SYSROOT "$ENV{NVLDM_WINDOWS_SYSROOT}")
endif()
# The project in which CMake tries the compiler out asks this file again.
list(APPEND CMAKE_TRY_COMPILE_PLATFORM_VARIABLES NVLDM_WINDOWS_SYSROOT)

# What runs in the build is the machine's own; what is linked never is.
set(CMAKE_FIND_ROOT_PATH "${NVLDM_WINDOWS_SYSROOT}" /usr/${triplet})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)

# Programs and libraries carry no time, so that the same sources give the same bytes.
foreach(kind EXE SHARED MODULE)
    set(CMAKE_${kind}_LINKER_FLAGS_INIT "-Wl,--no-insert-timestamp")
endforeach()

# Windows 10 and later; the older interfaces lack what the manifest asks for.
add_compile_definitions(_WIN32_WINNT=0x0A00 WINVER=0x0A00)
