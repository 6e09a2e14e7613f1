hmi_add_test(popup domainblockedpopupstate)
hmi_add_test(popup popupinterruptionstore)
hmi_add_test(popup popupinterruptionstoreloading)
hmi_add_test(popup popuptimeoutmonitor)
set_property(TEST popuptimeoutmonitor APPEND PROPERTY LABELS realtime)
target_compile_definitions(tst_popupinterruptionstoreloading PRIVATE
    HMI_TEST_DATA_DIR="${CMAKE_CURRENT_SOURCE_DIR}/data")
if(HMISTATEMACHINE_SANITIZE)
    # Sanitizers bring an allocator of their own, which a test cannot count in.
    message(STATUS "Test of the popup rules' allocations: off (HMISTATEMACHINE_SANITIZE)")
else()
    hmi_add_test(popup popupinterruptionstoreallocation)
endif()
