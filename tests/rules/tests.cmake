# Debian's Python has Debian's modules; another one may come before it in the search path.
find_program(HMI_TEST_PYTHON NAMES python3 PATHS /usr/bin NO_DEFAULT_PATH)
find_program(HMI_TEST_PYTHON NAMES python3 REQUIRED)
foreach(module IN ITEMS jsonschema selenium)
    execute_process(COMMAND ${HMI_TEST_PYTHON} -c "import ${module}"
        RESULT_VARIABLE missing OUTPUT_QUIET ERROR_QUIET)
    if(missing)
        message(FATAL_ERROR "${HMI_TEST_PYTHON} has no module ${module}, which the tests of hmi-rules "
            "need (in Debian python3-${module})")
    endif()
endforeach()
add_test(NAME rulesschema
    COMMAND ${HMI_TEST_PYTHON} ${CMAKE_CURRENT_SOURCE_DIR}/rules/schema/tst_schema.py)
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

if(TARGET hmi_rules_docs)
    find_program(HMI_TEST_BASH NAMES bash REQUIRED)
    find_program(HMI_TEST_GROFF NAMES groff REQUIRED)
    get_target_property(man_page hmi_rules_docs HMI_MAN_PAGE)
    get_target_property(completion hmi_rules_docs HMI_COMPLETION)
    foreach(name IN ITEMS bashcompletion manpage)
        hmi_add_test(rules ${name})
        add_dependencies(tst_${name} hmi_rules_docs)
        target_link_libraries(tst_${name} PRIVATE hmi_rules_docgen_parts)
    endforeach()
    target_compile_definitions(tst_bashcompletion PRIVATE
        HMI_TEST_BASH="${HMI_TEST_BASH}"
        HMI_COMPLETION="${completion}"
        HMI_COMPLETION_TEMPLATE="${PROJECT_SOURCE_DIR}/tools/hmi-rules/docgen/completion.bash.in")
    target_compile_definitions(tst_manpage PRIVATE
        HMI_TEST_GROFF="${HMI_TEST_GROFF}"
        HMI_MAN_PAGE="${man_page}"
        HMI_PROJECT_VERSION="${PROJECT_VERSION}")
else()
    message(STATUS "Tests of the man page and completion of hmi-rules: off (they are not built)")
endif()

# The page of a matrix in a browser: pages for the test, and one that the tool makes.
find_program(HMI_TEST_CHROMIUM NAMES chromium REQUIRED)
find_program(HMI_TEST_CHROMEDRIVER NAMES chromedriver REQUIRED)
set(page_test ${HMI_TEST_PYTHON} -B ${CMAKE_CURRENT_LIST_DIR}/page/page_test.py
    --chromium ${HMI_TEST_CHROMIUM} --chromedriver ${HMI_TEST_CHROMEDRIVER})
if(HMISTATEMACHINE_TEST_PACKAGE) # the parts of the page are the same whatever compiles the tool
    add_test(NAME rules-page
        COMMAND ${page_test} --parts ${PROJECT_SOURCE_DIR}/tools/hmi-rules/matrix/page)
    set_tests_properties(rules-page PROPERTIES LABELS rules TIMEOUT 120)
endif()
set(page ${CMAKE_CURRENT_BINARY_DIR}/rules-page.html)
add_test(NAME rules-page-make
    COMMAND hmi-rules matrix --format html -o ${page} interruptions.json
    WORKING_DIRECTORY ${CMAKE_CURRENT_LIST_DIR}/page)
add_test(NAME rules-page-made
    COMMAND ${page_test} --page ${page} --expect ${CMAKE_CURRENT_LIST_DIR}/page/expected.json)
set_tests_properties(rules-page-make PROPERTIES FIXTURES_SETUP rules_page)
set_tests_properties(rules-page-made PROPERTIES FIXTURES_REQUIRED rules_page)
set_tests_properties(rules-page-make rules-page-made PROPERTIES
    LABELS rules TIMEOUT 120)

# For files with repeated keys or faults, in which Qt leaks.
set(HMI_QT_JSON_LEAKS
    LSAN_OPTIONS=suppressions=${CMAKE_CURRENT_SOURCE_DIR}/rules/qtjson.supp:print_suppressions=0)

# hmi-rules run in the test's own process, compared with the files that are listed in a folder.
add_library(hmi_rules_goldens STATIC rules/goldens.cpp rules/goldens.h)
hmi_target_defaults(hmi_rules_goldens)
target_include_directories(hmi_rules_goldens PUBLIC ${CMAKE_CURRENT_SOURCE_DIR}/rules)
target_link_libraries(hmi_rules_goldens PUBLIC hmi_rules_parts Qt5::Test)
set(HMI_DATA_OF_lintcases ${CMAKE_CURRENT_SOURCE_DIR}/rules/lint)
set(HMI_DATA_OF_lintcompleteness ${CMAKE_CURRENT_SOURCE_DIR}/data/interruptions)
set(HMI_DATA_OF_sarif ${CMAKE_CURRENT_SOURCE_DIR}/rules/output)
set(HMI_DATA_OF_toolcases ${CMAKE_CURRENT_SOURCE_DIR}/rules/output)
foreach(name IN ITEMS lintcases lintcompleteness sarif toolcases)
    hmi_add_test(rules ${name})
    target_link_libraries(tst_${name} PRIVATE hmi_rules_goldens)
    target_compile_definitions(tst_${name} PRIVATE HMI_TEST_DATA_DIR="${HMI_DATA_OF_${name}}")
    set_tests_properties(${name} PROPERTIES ENVIRONMENT "${HMI_QT_JSON_LEAKS}")
endforeach()
target_compile_definitions(tst_toolcases PRIVATE
    HMI_POPUP_RULES_PAGE="${PROJECT_SOURCE_DIR}/docs/popup-rules.md"
    HMI_RULES_SCHEMA="${PROJECT_SOURCE_DIR}/tools/hmi-rules/schema/popup-interruptions.schema.json")

# Files of rules made at random, and what must hold for any of them.
foreach(name IN ITEMS rulesproperty rulespropertydiff rulespropertyreports)
    hmi_add_test(rules ${name})
    target_sources(tst_${name} PRIVATE
        random/seeds.cpp
        random/seeds.h
        rules/random/rulemaker.cpp
        rules/random/rulemaker.h
        rules/random/stores.cpp
        rules/random/stores.h)
    target_link_libraries(tst_${name} PRIVATE hmi_rules_parts)
    set_tests_properties(${name} PROPERTIES TIMEOUT 120)
    if(HMISTATEMACHINE_SANITIZE)
        set_tests_properties(${name} PROPERTIES
            ENVIRONMENT "HMI_RANDOM_STEPS=10;${HMI_QT_JSON_LEAKS}")
    endif()
endforeach()
target_sources(tst_rulesproperty PRIVATE
    rules/random/decisioncase.cpp
    rules/random/decisioncase.h)

if(HMISTATEMACHINE_BUILD_FUZZERS)
    add_subdirectory(rules/fuzz)
else()
    message(STATUS "Random input for hmi-rules: off (HMISTATEMACHINE_BUILD_FUZZERS)")
endif()

# The whole program with files, streams and environments that something is wrong with.
foreach(name IN ITEMS rulesbadinput rulesbadsurroundings)
    hmi_add_test(rules ${name})
    target_sources(tst_${name} PRIVATE
        rules/badinput/files.h
        rules/badinput/program.cpp
        rules/badinput/program.h)
    target_include_directories(tst_${name} PRIVATE rules)
    target_compile_definitions(tst_${name} PRIVATE
        HMI_RULES_PROGRAM="$<TARGET_FILE:hmi-rules>"
        HMI_TEST_DATA_DIR="${CMAKE_CURRENT_SOURCE_DIR}/rules/badinput")
    add_dependencies(tst_${name} hmi-rules)
    set_tests_properties(${name} PROPERTIES TIMEOUT 120 ENVIRONMENT "${HMI_QT_JSON_LEAKS}")
endforeach()
