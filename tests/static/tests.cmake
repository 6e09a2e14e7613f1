# Each check of the code that does not run it, as scripts/check does it for people.
foreach(check IN ITEMS cppcheck python shell spelling tidy)
    add_test(NAME check-${check} COMMAND ${PROJECT_SOURCE_DIR}/scripts/check --built ${check})
    set_tests_properties(check-${check} PROPERTIES LABELS static TIMEOUT 900)
endforeach()
set_tests_properties(check-tidy PROPERTIES PROCESSORS 2) # it takes all processors itself
