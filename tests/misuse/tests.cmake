# What happens when the library is used as it is not meant to be: docs/misuse.md.
foreach(name IN ITEMS
    changedwhilerunning gonewhilerunning machinerunning nullarguments oddvalues)
    hmi_add_test(misuse ${name})
endforeach()
set_tests_properties(nullarguments PROPERTIES ENVIRONMENT "${HMI_LOST_EVENTS}")
if(HMISTATEMACHINE_WITH_QUICK)
    hmi_add_test(misuse quickviewlayer)
    target_link_libraries(tst_quickviewlayer PRIVATE hmi_quick_test_support)
    set_tests_properties(quickviewlayer PROPERTIES ENVIRONMENT "${HMI_OFFSCREEN_ENVIRONMENT}")
endif()
