add_library(hmi_quick_test_support STATIC
    quick/quickflow.cpp
    quick/quickflow.h
    quick/scene.cpp
    quick/scene.h)
hmi_target_defaults(hmi_quick_test_support)
target_include_directories(hmi_quick_test_support PUBLIC quick)
target_link_libraries(hmi_quick_test_support PUBLIC hmi_test_support HmiStateMachine::Quick)

function(hmi_add_quick_test name)
    hmi_add_test(quick ${name})
    target_link_libraries(tst_${name} PRIVATE hmi_quick_test_support)
    set_tests_properties(${name} PROPERTIES ENVIRONMENT "${HMI_OFFSCREEN_ENVIRONMENT}")
endfunction()

hmi_add_quick_test(popuphost)
hmi_add_quick_test(popuplistmodel)
hmi_add_quick_test(quickviewstatetarget)
hmi_add_quick_test(requests)
hmi_add_quick_test(screenhost)
set_property(TEST screenhost APPEND PROPERTY LABELS realtime)

# Tools of Qt's own folder first: what lies in the search path may be for another version.
get_target_property(qmake Qt5::qmake IMPORTED_LOCATION)
get_filename_component(qt_bin_dir ${qmake} DIRECTORY)
execute_process(COMMAND ${qmake} -query QT_INSTALL_QML
    OUTPUT_VARIABLE qt_qml_dir OUTPUT_STRIP_TRAILING_WHITESPACE)
find_program(HMI_TEST_QMLPLUGINDUMP NAMES qmlplugindump HINTS ${qt_bin_dir} REQUIRED)
find_program(HMI_TEST_QMLLINT NAMES qmllint HINTS ${qt_bin_dir} REQUIRED)

set(qml_dirs ${PROJECT_SOURCE_DIR}/src/HmiStateMachineQuick ${PROJECT_SOURCE_DIR}/examples)
add_test(NAME quick-qmllint COMMAND ${CMAKE_COMMAND}
    -D LINT=${HMI_TEST_QMLLINT}
    "-DDIRS=${qml_dirs}"
    -P ${CMAKE_CURRENT_SOURCE_DIR}/quick/qmllint.cmake)
set(quick_tool_tests quick-qmllint)

if(TARGET hmistatemachineplugin)
    hmi_add_quick_test(qmlmodule)
    add_executable(hmi_quick_viewer quick/viewer.cpp)
    hmi_target_defaults(hmi_quick_viewer)
    target_compile_features(hmi_quick_viewer PRIVATE cxx_std_17)
    target_link_libraries(hmi_quick_viewer PRIVATE Qt5::Quick)
    add_dependencies(tst_qmlmodule hmi_quick_viewer hmistatemachineplugin)
    target_compile_definitions(tst_qmlmodule PRIVATE
        HMI_QUICK_VIEWER="$<TARGET_FILE:hmi_quick_viewer>"
        HMI_QML_DIR="${HMISTATEMACHINE_QML_DIR}")

    # What the head unit registers itself has no description for the tool to read.
    add_test(NAME quick-qmllint-unqualified COMMAND ${CMAKE_COMMAND}
        -D LINT=${HMI_TEST_QMLLINT}
        -D UNQUALIFIED=ON
        "-DDIRS=${PROJECT_SOURCE_DIR}/src/HmiStateMachineQuick;${PROJECT_SOURCE_DIR}/examples/quickstart-qml"
        "-DIMPORT_DIRS=${qt_qml_dir};${HMISTATEMACHINE_QML_DIR}"
        -P ${CMAKE_CURRENT_SOURCE_DIR}/quick/qmllint.cmake)
    list(APPEND quick_tool_tests quick-qmllint-unqualified)
else()
    message(STATUS "Tests of the QML plugin: off, because there is none (BUILD_SHARED_LIBS)")
endif()

if(TARGET hmistatemachineplugin AND NOT HMISTATEMACHINE_SANITIZE)
    add_test(NAME quick-qmltypes COMMAND ${CMAKE_COMMAND}
        -D DUMP=${HMI_TEST_QMLPLUGINDUMP}
        -D QML_DIR=${HMISTATEMACHINE_QML_DIR}
        -D EXPECTED=${PROJECT_SOURCE_DIR}/src/HmiStateMachineQuick/plugin/plugins.qmltypes
        -D ACTUAL=${CMAKE_CURRENT_BINARY_DIR}/plugins.qmltypes.actual
        -P ${CMAKE_CURRENT_SOURCE_DIR}/quick/qmltypes.cmake)
    list(APPEND quick_tool_tests quick-qmltypes)
elseif(HMISTATEMACHINE_SANITIZE)
    # Qt's tool is not sanitized itself, and cannot load a plugin that is.
    message(STATUS "Test of the module's description: off (HMISTATEMACHINE_SANITIZE)")
endif()
set_tests_properties(${quick_tool_tests} PROPERTIES
    LABELS quick TIMEOUT 60 ENVIRONMENT "${HMI_OFFSCREEN_ENVIRONMENT}")
