# The schemas are judged by Debian's Python: another one in front of it may lack its modules.
find_program(HMI_RULES_PYTHON python3 PATHS /usr/bin NO_DEFAULT_PATH REQUIRED)
add_test(NAME rulesschema
    COMMAND ${HMI_RULES_PYTHON} ${CMAKE_CURRENT_SOURCE_DIR}/rules/schema/tst_schema.py)
set_tests_properties(rulesschema PROPERTIES LABELS rules TIMEOUT 30)

hmi_add_test(rules popuprulespage)
target_compile_definitions(tst_popuprulespage PRIVATE
    HMI_POPUP_RULES_PAGE="${PROJECT_SOURCE_DIR}/docs/popup-rules.md")

hmi_add_test(rules popuprulesscreen)
foreach(name IN ITEMS commandline commandlineerrors commandlinehelp)
    hmi_add_test(rules ${name})
    target_link_libraries(tst_${name} PRIVATE hmi_rules_parts)
endforeach()
target_sources(tst_commandline PRIVATE rules/optiontext.cpp rules/optiontext.h)
target_compile_definitions(tst_commandlinehelp PRIVATE
    HMI_TEST_DATA_DIR="${CMAKE_CURRENT_SOURCE_DIR}/rules/help"
    HMI_PROJECT_VERSION="${PROJECT_VERSION}")
