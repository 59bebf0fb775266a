# Toolchain of Debian's mingw-w64, the kind whose threads are the standard library's.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)
set(CMAKE_C_COMPILER x86_64-w64-mingw32-gcc-posix)
set(CMAKE_CXX_COMPILER x86_64-w64-mingw32-g++-posix)
set(CMAKE_RC_COMPILER x86_64-w64-mingw32-windres)
set(CMAKE_FIND_ROOT_PATH /usr/x86_64-w64-mingw32)
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)
# Where libraries that are headers alone are, which serve every system.
set(QRX_HOST_HEADERS /usr/include)
set(QRX_GOOGLETEST_SOURCES /usr/src/googletest/googletest)
# CMake finds it by a program of this system, which gives this system's library.
set(CMAKE_DISABLE_FIND_PACKAGE_HDF5 ON)
# One file that needs no other.
set(CMAKE_EXE_LINKER_FLAGS_INIT "-static")
