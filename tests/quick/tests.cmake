add_library(hmi_quick_test_support STATIC
    quick/quickflow.cpp
    quick/quickflow.h
    quick/scene.cpp
    quick/scene.h)
hmi_target_defaults(hmi_quick_test_support)
target_include_directories(hmi_quick_test_support PUBLIC quick)
target_link_libraries(hmi_quick_test_support PUBLIC hmi_test_support HmiStateMachine::Quick)

# They draw into memory, so that no screen is needed.
set(HMI_QUICK_TEST_ENVIRONMENT QT_QPA_PLATFORM=offscreen QT_QUICK_BACKEND=software)

function(hmi_add_quick_test name)
    hmi_add_test(quick ${name})
    target_link_libraries(tst_${name} PRIVATE hmi_quick_test_support)
    set_tests_properties(${name} PROPERTIES ENVIRONMENT "${HMI_QUICK_TEST_ENVIRONMENT}")
endfunction()

hmi_add_quick_test(popuphost)
hmi_add_quick_test(popuplistmodel)
hmi_add_quick_test(quickviewstatetarget)
hmi_add_quick_test(requests)
hmi_add_quick_test(screenhost)
set_property(TEST screenhost APPEND PROPERTY LABELS realtime)
