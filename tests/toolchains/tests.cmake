# What CMake makes of the toolchain files for QNX; there is no QNX here to build with.

set(HMI_QNX_VARIANT_OF_aarch64 gcc_ntoaarch64le)
set(HMI_QNX_VARIANT_OF_x86_64 gcc_ntox86_64)
find_program(HMI_TEST_TOOLCHAIN_GXX NAMES g++ REQUIRED)
foreach(processor IN ITEMS aarch64 x86_64)
    add_test(NAME toolchain-qnx7-${processor} COMMAND ${CMAKE_COMMAND}
        -D TOOLCHAIN=${PROJECT_SOURCE_DIR}/cmake/toolchains/qnx7-${processor}.cmake
        -D PROCESSOR=${processor}
        -D VARIANT=${HMI_QNX_VARIANT_OF_${processor}}
        -D COMPILER=${HMI_TEST_TOOLCHAIN_GXX}
        -D WORK_DIR=${CMAKE_CURRENT_BINARY_DIR}/toolchain-qnx7-${processor}
        -P ${CMAKE_CURRENT_LIST_DIR}/toolchain.cmake)
    set_tests_properties(toolchain-qnx7-${processor} PROPERTIES LABELS package TIMEOUT 120)
endforeach()
