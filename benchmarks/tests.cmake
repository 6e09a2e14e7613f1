set(tests_dir ${CMAKE_CURRENT_SOURCE_DIR}/tests)

# All engines show the same, whatever the build.
add_test(NAME benchmark-check COMMAND hmi-benchmark --check)
set_tests_properties(benchmark-check PROPERTIES LABELS benchmark TIMEOUT 120)

# hmi_add_refusal_test(<name> <exit code> <argument>...): tests/<name>.expected stands on stderr.
function(hmi_add_refusal_test name exit_code)
    hmi_add_output_test(benchmark-${name}
        COMMAND hmi-benchmark ${ARGN}
        EXPECTED ${tests_dir}/${name}.expected
        EXIT_CODE ${exit_code}
        STREAM stderr
        DIRECTORY ${tests_dir}
        LABELS benchmark)
endfunction()

hmi_add_refusal_test(unknown-workload 2 --only W1 --only W1/11)
hmi_add_refusal_test(unknown-option 2 --round 5)
hmi_add_refusal_test(stray-argument 2 W1)
hmi_add_refusal_test(rounds-out-of-range 2 --rounds 0)
hmi_add_refusal_test(rounds-not-a-number 2 --rounds many)
hmi_add_refusal_test(two-tasks 2 --check --list)
hmi_add_refusal_test(check-writes-no-file 2 --check --json out.json)
hmi_add_refusal_test(before-missing 2 --before nowhere.json)
hmi_add_refusal_test(before-broken 2 --before broken.json)
hmi_add_refusal_test(before-without-workloads 2 --before empty.json)
hmi_add_refusal_test(before-without-id 2 --before nameless.json)
hmi_add_refusal_test(text-not-writable 2 --text nowhere/out.txt)
hmi_add_refusal_test(smoke-missing 2 --only W3 --smoke nowhere.json)
hmi_add_refusal_test(smoke-watches-nothing 2 --only W7 --smoke tiny.json)

# Instructions have not grown since the figures that are part of the project, a family a test.
if(CMAKE_BUILD_TYPE MATCHES "^(Release|RelWithDebInfo)$")
    hmi_add_refusal_test(smoke-without-row 1 --only W6/exact --smoke tiny.json)
    # The figure found differs from build to build, so that only the rest of the message is compared.
    add_test(NAME benchmark-smoke-sees-growth
        COMMAND hmi-benchmark --only W6/mixed --smoke ${tests_dir}/tiny.json)
    set_tests_properties(benchmark-smoke-sees-growth PROPERTIES
        LABELS benchmark
        TIMEOUT 60
        PASS_REGULAR_EXPRESSION
            "W6/mixed .*: [0-9]+ instructions, in .*tiny.json it is 1; a tenth more is allowed")
    foreach(family IN ITEMS W1 W1T W1P W3 W5 W6)
        add_test(NAME perf-smoke-${family}
            COMMAND hmi-benchmark --only ${family}
                --smoke ${CMAKE_CURRENT_SOURCE_DIR}/results/current.json)
        set_tests_properties(perf-smoke-${family} PROPERTIES LABELS perf-smoke TIMEOUT 180)
    endforeach()
else()
    message(STATUS "Tests of the benchmarks that count instructions: off, they need an optimised "
        "build (CMAKE_BUILD_TYPE Release or RelWithDebInfo)")
endif()
