hmi_add_test(rules popuprulespage)
target_compile_definitions(tst_popuprulespage PRIVATE
    HMI_POPUP_RULES_PAGE="${PROJECT_SOURCE_DIR}/docs/popup-rules.md")

hmi_add_test(rules popuprulesscreen)
