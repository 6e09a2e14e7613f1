# What is tested with the scene, drawn by Qt Quick's own renderer on a display that nobody sees.
find_package(Qt5 5.15 REQUIRED COMPONENTS Test)
find_program(XVFB_RUN xvfb-run DOC "Runs a program on a display of its own")
if(NOT XVFB_RUN)
    message(FATAL_ERROR "The tests of the scene need xvfb-run, found none. "
        "Remedy: apt-get install xvfb xauth, or -DHMISTATEMACHINE_BUILD_TESTS=OFF")
endif()
set(on_a_display ${XVFB_RUN} -a -s "-screen 0 1920x1080x24")
set(scene_tests_dir ${CMAKE_CURRENT_SOURCE_DIR}/tests/scene)

# Qt wants it to be the user's alone.
set(runtime_dir ${CMAKE_CURRENT_BINARY_DIR}/runtime)
file(MAKE_DIRECTORY ${runtime_dir})
file(CHMOD ${runtime_dir} DIRECTORY_PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE)

set(scene_environment
    QT_QUICK_BACKEND=software
    XDG_RUNTIME_DIR=${runtime_dir}
    LSAN_OPTIONS=fast_unwind_on_malloc=0:suppressions=${scene_tests_dir}/leaks.supp:print_suppressions=0)
set(no_display DISPLAY=unset: WAYLAND_DISPLAY=unset: QT_QPA_PLATFORM=unset:)

# Their displays are started one after the other: two at once may choose the same number.
function(hmi_test_on_a_display)
    set_tests_properties(${ARGN} PROPERTIES
        LABELS scene
        TIMEOUT 300
        RESOURCE_LOCK display
        ENVIRONMENT "${scene_environment};QT_QPA_PLATFORM=xcb"
        ENVIRONMENT_MODIFICATION "DISPLAY=unset:;WAYLAND_DISPLAY=unset:")
endfunction()

# A test program from tests/scene/<program>.cpp.
function(hmi_add_scene_program program)
    add_executable(${program} ${scene_tests_dir}/${program}.cpp)
    hmi_target_defaults(${program})
    target_link_libraries(${program} PRIVATE headunit_parts headunit_scene_support Qt5::Test)
endfunction()

add_library(headunit_scene_support OBJECT
    ${scene_tests_dir}/cockpit.cpp
    ${scene_tests_dir}/cockpit.h
    ${scene_tests_dir}/seenbyuser.cpp
    ${scene_tests_dir}/seenbyuser.h)
hmi_target_defaults(headunit_scene_support)
target_link_libraries(headunit_scene_support PUBLIC headunit_parts)
target_include_directories(headunit_scene_support PUBLIC ${scene_tests_dir})

hmi_add_scene_program(tst_scenescenario)

# Each scenario tells the same with the scene as without it, and each of its steps is looked at.
foreach(scenario IN LISTS scenarios)
    get_filename_component(name ${scenario} NAME_WE)
    set(options "")
    if(EXISTS ${scenarios_dir}/${name}.options)
        file(STRINGS ${scenarios_dir}/${name}.options options)
    endif()
    hmi_add_output_test(scene-scenario-${name}
        COMMAND headunit ${options} ${name}.scenario
        EXPECTED ${scenarios_dir}/${name}.expected
        DIRECTORY ${scenarios_dir}
        LAUNCHER ${on_a_display})
    add_test(NAME scene-steps-${name}
        COMMAND ${on_a_display} $<TARGET_FILE:tst_scenescenario> ${options} ${name}.scenario
        WORKING_DIRECTORY ${scenarios_dir})
    hmi_test_on_a_display(scene-scenario-${name} scene-steps-${name})
endforeach()

# The ways to fail that have to do with the scene: as in tests/faults, but without "--headless".
file(GLOB scene_faults CONFIGURE_DEPENDS ${scene_tests_dir}/faults/*.arguments)
foreach(fault IN LISTS scene_faults)
    get_filename_component(name ${fault} NAME_WE)
    file(STRINGS ${fault} arguments)
    set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${fault})
    list(POP_FRONT arguments exit_code)
    set(launcher ${on_a_display})
    if(name MATCHES "^no-display")
        set(launcher "")
    endif()
    hmi_add_output_test(scene-fault-${name}
        COMMAND headunit ${arguments}
        EXPECTED ${scene_tests_dir}/faults/${name}.expected
        EXIT_CODE ${exit_code}
        STREAM stderr
        DIRECTORY ${scene_tests_dir}/faults
        LAUNCHER ${launcher})
    hmi_test_on_a_display(scene-fault-${name})
    if(name MATCHES "^no-display")
        set_tests_properties(scene-fault-${name} PROPERTIES
            ENVIRONMENT "${scene_environment}"
            ENVIRONMENT_MODIFICATION "${no_display}")
    endif()
endforeach()

hmi_add_scene_program(tst_screenshots)
target_compile_definitions(tst_screenshots PRIVATE
    HEADUNIT="$<TARGET_FILE:headunit>"
    SCENARIO="${scene_tests_dir}/screenshots.scenario")
add_test(NAME screenshots COMMAND ${on_a_display} $<TARGET_FILE:tst_screenshots>)
hmi_test_on_a_display(screenshots)

hmi_add_scene_program(tst_flowpause)
add_test(NAME flowpause COMMAND tst_flowpause)
set_tests_properties(flowpause PROPERTIES LABELS "scene;realtime" TIMEOUT 30)

hmi_add_scene_program(tst_sceneinput)
add_test(NAME sceneinput COMMAND ${on_a_display} $<TARGET_FILE:tst_sceneinput>)
hmi_test_on_a_display(sceneinput)

hmi_add_scene_program(tst_scenegrowth)
target_compile_definitions(tst_scenegrowth PRIVATE ROUND="${scene_tests_dir}/growth.scenario")
add_test(NAME scenegrowth COMMAND ${on_a_display} $<TARGET_FILE:tst_scenegrowth>)
hmi_test_on_a_display(scenegrowth)
# It counts what is left while it runs; the other tests look for leaks, for which each allocation is
# traced to its root, too slowly for so many.
set_tests_properties(scenegrowth PROPERTIES
    TIMEOUT 900
    ENVIRONMENT "${scene_environment};QT_QPA_PLATFORM=xcb;ASAN_OPTIONS=detect_leaks=0;LSAN_OPTIONS=")
