# The examples in the comments of the public headers: each block of C++ becomes a file beside the
# build, which a function of a test includes; blocks of QML are read by the test itself.

set(examples_dir ${CMAKE_CURRENT_BINARY_DIR}/headerexamples)

# Writes the example of each header in a folder, and fails when the test has no function for it.
function(hmi_extract_examples test_source)
    file(STRINGS ${test_source} used REGEX "^#include \"[a-z]+\\.inc\"$")
    foreach(header IN LISTS ARGN)
        set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${header})
        file(READ ${header} text)
        if(NOT text MATCHES "@code\n([^@]*)@endcode")
            continue()
        endif()
        string(REGEX REPLACE "(^|\n) \\* ?" "\\1" example "${CMAKE_MATCH_1}")
        get_filename_component(name ${header} NAME_WE)
        if(NOT "#include \"${name}.inc\"" IN_LIST used)
            message(FATAL_ERROR "${test_source} has no function for the example in ${header}")
        endif()
        file(CONFIGURE OUTPUT ${examples_dir}/${name}.inc CONTENT "${example}" @ONLY)
    endforeach()
endfunction()

file(GLOB headers CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/src/HmiStateMachine/*/*.h)
hmi_extract_examples(${CMAKE_CURRENT_SOURCE_DIR}/headers/tst_headerexamples.cpp ${headers})
hmi_add_test(headers headerexamples)
target_include_directories(tst_headerexamples PRIVATE ${examples_dir})

if(HMISTATEMACHINE_WITH_QUICK)
    file(GLOB headers CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/src/HmiStateMachineQuick/*.h)
    hmi_extract_examples(${CMAKE_CURRENT_SOURCE_DIR}/headers/tst_quickheaderexamples.cpp ${headers})
    hmi_add_test(headers quickheaderexamples)
    set_target_properties(tst_quickheaderexamples PROPERTIES AUTORCC ON)
    target_sources(tst_quickheaderexamples PRIVATE headers/scene.qrc)
    target_include_directories(tst_quickheaderexamples PRIVATE ${examples_dir})
    target_compile_definitions(tst_quickheaderexamples PRIVATE
        HMI_QUICK_HEADERS_DIR="${PROJECT_SOURCE_DIR}/src/HmiStateMachineQuick")
    target_link_libraries(tst_quickheaderexamples PRIVATE hmi_quick_test_support)
    set_tests_properties(quickheaderexamples PROPERTIES
        ENVIRONMENT "${HMI_OFFSCREEN_ENVIRONMENT}")
endif()
