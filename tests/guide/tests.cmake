# The pages for whoever learns the library: what they show is what the programs are and print.
find_program(HMI_TEST_PYTHON NAMES python3 PATHS /usr/bin NO_DEFAULT_PATH)
find_program(HMI_TEST_PYTHON NAMES python3 REQUIRED)

# What a program writes, with the messages of the library among it.
function(hmi_add_guide_output name expected target)
    hmi_add_output_test(${name} COMMAND ${target} ${ARGN} EXPECTED ${expected} STREAM stderr
        LABELS guide)
    set_tests_properties(${name} PROPERTIES ENVIRONMENT QT_FORCE_STDERR_LOGGING=1)
endfunction()

# What is on a page is in the folder, or in one of those that follow; all output in the folder is shown.
function(hmi_add_guide_page name folder)
    set(page ${PROJECT_SOURCE_DIR}/docs/${name}.md)
    set(folders ${folder} ${ARGN})
    add_test(NAME guide-${name}-code COMMAND ${CMAKE_COMMAND}
        -D PAGE=${page}
        -D "EXAMPLE_DIR=${folders}"
        -P ${PROJECT_SOURCE_DIR}/tests/quickstart/docs.cmake)
    add_test(NAME guide-${name}-whole
        COMMAND ${HMI_TEST_PYTHON} -B ${CMAKE_CURRENT_FUNCTION_LIST_DIR}/page_is_whole.py
            ${page} ${folder})
    set_tests_properties(guide-${name}-code guide-${name}-whole PROPERTIES LABELS guide TIMEOUT 30)
endfunction()

if(HMISTATEMACHINE_BUILD_EXAMPLES)
    include(guide/tutorial.cmake)
    include(guide/recipes.cmake)
else()
    message(STATUS "Tests of the tutorial and the recipes: off (HMISTATEMACHINE_BUILD_EXAMPLES)")
endif()

# Moving from bare Qt: both programs of the page show the same.
foreach(program IN ITEMS bareqt library)
    add_executable(fromqt-${program} guide/fromqt/${program}.cpp)
    hmi_target_defaults(fromqt-${program})
    set_target_properties(fromqt-${program} PROPERTIES AUTOMOC OFF)
    target_compile_features(fromqt-${program} PRIVATE cxx_std_17)
    target_include_directories(fromqt-${program} PRIVATE ${PROJECT_SOURCE_DIR}/examples/tutorial)
    target_link_libraries(fromqt-${program} PRIVATE HmiStateMachine::HmiStateMachine)
    hmi_add_guide_output(fromqt-${program} ${CMAKE_CURRENT_LIST_DIR}/fromqt/output.expected
        fromqt-${program})
endforeach()
hmi_add_guide_page(from-qstatemachine ${CMAKE_CURRENT_LIST_DIR}/fromqt)
hmi_add_test(guide mixing)
