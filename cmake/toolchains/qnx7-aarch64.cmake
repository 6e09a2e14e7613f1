# QNX 7 on 64-bit ARM. UNTESTED HERE: written from QNX's and CMake's documentation; nothing has been
# built with it, because the project's own machines have no QNX SDK. See docs/porting.md.

set(CMAKE_SYSTEM_PROCESSOR aarch64)
set(HMI_QNX_VARIANT gcc_ntoaarch64le)
set(HMI_QNX_TARGET_FOLDER aarch64le)
include(${CMAKE_CURRENT_LIST_DIR}/qnx7.cmake)
