# What the toolchain files for QNX 7 share. UNTESTED HERE, as they are.
#
# From the environment, as qnxsdp-env.sh sets them: QNX_HOST, with the compilers, and QNX_TARGET, with
# the target's headers and libraries. HMI_QNX_QT_DIR is the folder of the Qt 5 that is built for the
# target, with lib/cmake/Qt5Core in it; its moc and rcc have to run on the host.

set(CMAKE_SYSTEM_NAME QNX)
set(CMAKE_SYSTEM_VERSION 7)

foreach(variable IN ITEMS QNX_HOST QNX_TARGET)
    if("$ENV{${variable}}" STREQUAL "")
        message(FATAL_ERROR "${variable} is not set in the environment. Source qnxsdp-env.sh of the QNX "
            "SDK first.")
    endif()
endforeach()
foreach(variable IN ITEMS QNX_HOST QNX_TARGET)
    if(NOT IS_DIRECTORY "$ENV{${variable}}")
        message(FATAL_ERROR "${variable} is no folder: $ENV{${variable}}")
    endif()
    file(TO_CMAKE_PATH "$ENV{${variable}}" HMI_${variable})
endforeach()

if(CMAKE_HOST_WIN32)
    set(HMI_EXECUTABLE_SUFFIX .exe)
else()
    set(HMI_EXECUTABLE_SUFFIX "")
endif()
set(CMAKE_C_COMPILER ${HMI_QNX_HOST}/usr/bin/qcc${HMI_EXECUTABLE_SUFFIX})
set(CMAKE_CXX_COMPILER ${HMI_QNX_HOST}/usr/bin/q++${HMI_EXECUTABLE_SUFFIX})
foreach(compiler IN ITEMS ${CMAKE_C_COMPILER} ${CMAKE_CXX_COMPILER})
    if(NOT EXISTS ${compiler})
        message(FATAL_ERROR "There is no compiler ${compiler}. QNX_HOST has to be the host folder of a "
            "QNX SDK 7.")
    endif()
endforeach()

# CMake hands the target on to qcc and q++ as -V<variant>.
set(CMAKE_C_COMPILER_TARGET ${HMI_QNX_VARIANT})
set(CMAKE_CXX_COMPILER_TARGET ${HMI_QNX_VARIANT})

# Programs are the host's; headers, libraries and packages are the target's, and nobody else's.
list(APPEND CMAKE_FIND_ROOT_PATH ${HMI_QNX_TARGET} ${HMI_QNX_TARGET}/${HMI_QNX_TARGET_FOLDER})
set(HMI_QNX_QT_DIR "" CACHE PATH "The Qt 5 that is built for QNX")
if(HMI_QNX_QT_DIR)
    if(NOT EXISTS ${HMI_QNX_QT_DIR}/lib/cmake/Qt5Core)
        message(FATAL_ERROR "HMI_QNX_QT_DIR holds no Qt 5: ${HMI_QNX_QT_DIR}/lib/cmake/Qt5Core is missing")
    endif()
    list(APPEND CMAKE_FIND_ROOT_PATH ${HMI_QNX_QT_DIR})
endif()
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE ONLY)

# CMake reads this file again for each check that it compiles.
list(APPEND CMAKE_TRY_COMPILE_PLATFORM_VARIABLES HMI_QNX_QT_DIR)
