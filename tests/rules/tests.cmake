# The schemas are judged by Debian's Python: another one in front of it may lack its modules.
find_program(HMI_RULES_PYTHON python3 PATHS /usr/bin NO_DEFAULT_PATH REQUIRED)
add_test(NAME rulesschema
    COMMAND ${HMI_RULES_PYTHON} ${CMAKE_CURRENT_SOURCE_DIR}/rules/schema/tst_schema.py)
set_tests_properties(rulesschema PROPERTIES LABELS rules TIMEOUT 30)

hmi_add_test(rules popuprulespage)
target_compile_definitions(tst_popuprulespage PRIVATE
    HMI_POPUP_RULES_PAGE="${PROJECT_SOURCE_DIR}/docs/popup-rules.md")

hmi_add_test(rules popuprulesscreen)
