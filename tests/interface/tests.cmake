# The interface as it was last committed: HmiStateMachine*.metaobjects and HmiStateMachine*.abi beside
# this file. "update-interface" renews them.

set(folder ${CMAKE_CURRENT_LIST_DIR})
set(HMI_INTERFACE_LIBRARIES HmiStateMachine)
set(HMI_INTERFACE_HEADERS_OF_HmiStateMachine ${HMISTATEMACHINE_PUBLIC_HEADERS})
if(HMISTATEMACHINE_WITH_QUICK)
    list(APPEND HMI_INTERFACE_LIBRARIES HmiStateMachineQuick)
    set(HMI_INTERFACE_HEADERS_OF_HmiStateMachineQuick ${HMISTATEMACHINE_QUICK_HEADERS})
endif()

add_library(hmi_interface_parts STATIC
    interface/metaobjects/changes.cpp
    interface/metaobjects/changes.h
    interface/metaobjects/dump.cpp
    interface/metaobjects/dump.h)
hmi_target_defaults(hmi_interface_parts)
target_include_directories(hmi_interface_parts PUBLIC interface/metaobjects)
target_link_libraries(hmi_interface_parts PUBLIC hmi_test_support)

foreach(name IN ITEMS metaobjectchanges metaobjectdump)
    hmi_add_test(interface ${name})
    target_link_libraries(tst_${name} PRIVATE hmi_interface_parts)
endforeach()

# The program that dumps the meta-objects of one library.
foreach(library IN LISTS HMI_INTERFACE_LIBRARIES)
    set(headers ${HMI_INTERFACE_HEADERS_OF_${library}})
    list(TRANSFORM headers PREPEND ${PROJECT_SOURCE_DIR}/src/${library}/ OUTPUT_VARIABLE header_files)
    set(list_script ${folder}/metaobjects/listclasses.cmake)
    set(source ${CMAKE_CURRENT_BINARY_DIR}/${library}-metaobjects.cpp)
    add_custom_command(OUTPUT ${source}
        COMMAND ${CMAKE_COMMAND}
            "-DHEADERS=${headers}"
            -D FOLDER=${PROJECT_SOURCE_DIR}/src/${library}
            -D OUTPUT=${source}
            -P ${list_script}
        DEPENDS ${header_files} ${list_script}
        VERBATIM)
    set(program ${library}-metaobjects)
    add_executable(${program} ${source} interface/metaobjects/main.cpp)
    hmi_target_defaults(${program})
    target_link_libraries(${program} PRIVATE hmi_interface_parts ${library})
    add_test(NAME interface-metaobjects-${library}
        COMMAND ${program} compare ${folder}/${library}.metaobjects)
    set_tests_properties(interface-metaobjects-${library} PROPERTIES LABELS interface TIMEOUT 30)
    list(APPEND HMI_INTERFACE_UPDATES
        COMMAND ${program} write ${folder}/${library}.metaobjects)
endforeach()

# What abidw reads out of debug information differs by compiler, optimisation and processor: the
# dump is of a debug build by GCC for x86-64.
if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU" AND CMAKE_BUILD_TYPE STREQUAL "Debug" AND BUILD_SHARED_LIBS
        AND CMAKE_SYSTEM_PROCESSOR STREQUAL "x86_64" AND NOT HMISTATEMACHINE_SANITIZE
        AND HMISTATEMACHINE_TEST_PACKAGE)
    find_program(HMI_TEST_PYTHON NAMES python3 PATHS /usr/bin NO_DEFAULT_PATH)
    find_program(HMI_TEST_PYTHON NAMES python3 REQUIRED)
    find_program(HMI_TEST_ABIDW NAMES abidw REQUIRED)
    find_program(HMI_TEST_ABIDIFF NAMES abidiff REQUIRED)
    set(abi ${HMI_TEST_PYTHON} -B ${folder}/abi/abi.py)
    foreach(library IN LISTS HMI_INTERFACE_LIBRARIES)
        # GCC describes a class with virtual functions in one object file only, and abidw loses the
        # functions that are defined in others.
        target_compile_options(${library} PRIVATE -femit-class-debug-always)
        set(arguments $<TARGET_FILE:${library}> ${PROJECT_SOURCE_DIR}/src ${folder}/${library}.abi)
        add_test(NAME interface-abi-${library} COMMAND ${abi} compare ${arguments})
        set_tests_properties(interface-abi-${library} PROPERTIES LABELS interface TIMEOUT 300)
        list(APPEND HMI_INTERFACE_UPDATES COMMAND ${abi} write ${arguments})
    endforeach()
    add_test(NAME interface-abichecker
        COMMAND ${HMI_TEST_PYTHON} -B ${folder}/abi/tst_abi.py --compiler ${CMAKE_CXX_COMPILER})
    set_tests_properties(interface-abichecker PROPERTIES LABELS interface TIMEOUT 300)

    add_custom_target(update-interface ${HMI_INTERFACE_UPDATES} VERBATIM)
else()
    message(STATUS "Tests of the ABI: off (they are for a debug build of the shared library by GCC "
        "on x86-64 without sanitizers, with HMISTATEMACHINE_TEST_PACKAGE)")
endif()
