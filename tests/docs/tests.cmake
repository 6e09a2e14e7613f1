# The pages in docs tell the truth: in the preset that checks the package too.
if(NOT HMISTATEMACHINE_TEST_PACKAGE)
    message(STATUS "Tests of the pages in docs: off (HMISTATEMACHINE_TEST_PACKAGE)")
    return()
endif()

find_program(HMI_TEST_PYTHON NAMES python3 PATHS /usr/bin NO_DEFAULT_PATH)
find_program(HMI_TEST_PYTHON NAMES python3 REQUIRED)

# Pages that name tests, some of which are those of hmi-rules.
if(HMISTATEMACHINE_WITH_RULES_TOOL)
    file(GLOB behaviour_pages CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/docs/behaviour.md
        ${PROJECT_SOURCE_DIR}/docs/limits.md ${PROJECT_SOURCE_DIR}/docs/misuse.md)
    add_test(NAME behaviour-names COMMAND ${HMI_TEST_PYTHON} -B
        ${CMAKE_CURRENT_LIST_DIR}/testnames.py --programs $<TARGET_FILE_DIR:tst_namedstate>
        ${behaviour_pages})
    set_tests_properties(behaviour-names PROPERTIES LABELS "docs;package" TIMEOUT 120)
endif()

# Texts that pages quote for someone who searches a log.
add_test(NAME docs-quoted-texts COMMAND ${HMI_TEST_PYTHON} -B
    ${CMAKE_CURRENT_LIST_DIR}/quotedtexts.py
    --sources ${PROJECT_SOURCE_DIR}/src ${PROJECT_SOURCE_DIR}/tools
        ${PROJECT_SOURCE_DIR}/examples/headunit
    --pages ${PROJECT_SOURCE_DIR}/docs/why-no-popup.md
        ${PROJECT_SOURCE_DIR}/docs/why-back-went-there.md)
set_tests_properties(docs-quoted-texts PROPERTIES LABELS "docs;package" TIMEOUT 60)

# Each picture of a diagram is that of its source, and says what there is.
add_test(NAME docs-diagrams COMMAND ${HMI_TEST_PYTHON} -B
    ${CMAKE_CURRENT_LIST_DIR}/diagrams.py
    --docs ${PROJECT_SOURCE_DIR}/docs
    --headers ${PROJECT_SOURCE_DIR}/src/HmiStateMachine ${PROJECT_SOURCE_DIR}/examples/headunit)
set_tests_properties(docs-diagrams PROPERTIES LABELS "docs;package" TIMEOUT 60)

file(GLOB pages CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/*.md ${PROJECT_SOURCE_DIR}/docs/*.md
    ${PROJECT_SOURCE_DIR}/examples/*/README.md)
add_test(NAME docs-links COMMAND ${HMI_TEST_PYTHON} -B ${CMAKE_CURRENT_LIST_DIR}/links.py ${pages})
set_tests_properties(docs-links PROPERTIES LABELS "docs;package" TIMEOUT 60)
