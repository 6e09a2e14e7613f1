# The example that the way into Qt Quick is shown by: its scene and flow without its main().
set(quickstart_dir ${PROJECT_SOURCE_DIR}/examples/quickstart-qml)
hmi_add_test(quickstart quickstart)
target_sources(tst_quickstart PRIVATE
    ${quickstart_dir}/flow.cpp
    ${quickstart_dir}/flow.h
    ${quickstart_dir}/qml.qrc)
set_target_properties(tst_quickstart PROPERTIES AUTORCC ON)
target_include_directories(tst_quickstart PRIVATE ${quickstart_dir})
target_link_libraries(tst_quickstart PRIVATE HmiStateMachine::Quick)
set_tests_properties(quickstart PROPERTIES
    LABELS "quickstart;realtime"
    ENVIRONMENT "${HMI_OFFSCREEN_ENVIRONMENT}")

# So that it stays a quick start.
add_test(NAME quickstart-qml-size COMMAND ${CMAKE_COMMAND}
    -D EXAMPLE_DIR=${quickstart_dir}
    -D MAXIMUM=150
    -P ${CMAKE_CURRENT_LIST_DIR}/size.cmake)
set_tests_properties(quickstart-qml-size PROPERTIES LABELS quickstart TIMEOUT 30)

# What the page shows of it is what it is.
add_test(NAME quickstart-qml-docs COMMAND ${CMAKE_COMMAND}
    -D PAGE=${PROJECT_SOURCE_DIR}/docs/quickstart-qml.md
    -D EXAMPLE_DIR=${quickstart_dir}
    -P ${CMAKE_CURRENT_LIST_DIR}/docs.cmake)
set_tests_properties(quickstart-qml-docs PROPERTIES LABELS quickstart TIMEOUT 30)

# It can be copied out of here, and built with what is installed.
if(HMISTATEMACHINE_TEST_PACKAGE)
    add_test(NAME quickstart-qml-alone COMMAND ${CMAKE_COMMAND}
        -D BUILD_DIR=${PROJECT_BINARY_DIR}
        -D EXAMPLE_DIR=${quickstart_dir}
        -D PROGRAM=quickstart-qml
        -D WORK_DIR=${CMAKE_CURRENT_BINARY_DIR}/quickstart-alone
        -D CXX_COMPILER=${CMAKE_CXX_COMPILER}
        -P ${CMAKE_CURRENT_LIST_DIR}/alone.cmake)
    set_tests_properties(quickstart-qml-alone PROPERTIES LABELS "quickstart;package" TIMEOUT 900)
endif()

# What docs/qml.md shows is compiled, loaded and run.
hmi_add_test(quickstart qmlpage)
target_link_libraries(tst_qmlpage PRIVATE HmiStateMachine::Quick)
target_compile_definitions(tst_qmlpage PRIVATE
    SNIPPETS_DIR="${CMAKE_CURRENT_LIST_DIR}/snippets")
set_tests_properties(qmlpage PROPERTIES
    ENVIRONMENT "${HMI_OFFSCREEN_ENVIRONMENT}")
add_test(NAME quick-docs-code COMMAND ${CMAKE_COMMAND}
    -D PAGE=${PROJECT_SOURCE_DIR}/docs/qml.md
    -D EXAMPLE_DIR=${CMAKE_CURRENT_LIST_DIR}/snippets
    -P ${CMAKE_CURRENT_LIST_DIR}/docs.cmake)

# It leaves nothing out.
add_test(NAME quick-docs COMMAND ${CMAKE_COMMAND}
    -D PAGE=${PROJECT_SOURCE_DIR}/docs/qml.md
    -D TYPES=${PROJECT_SOURCE_DIR}/src/HmiStateMachineQuick/plugin/plugins.qmltypes
    -P ${CMAKE_CURRENT_LIST_DIR}/reference.cmake)
set_tests_properties(quick-docs-code quick-docs PROPERTIES LABELS quickstart TIMEOUT 30)
