set(scenarios_dir ${CMAKE_CURRENT_SOURCE_DIR}/scenarios)
set(faults_dir ${CMAKE_CURRENT_SOURCE_DIR}/tests/faults)

# One test for each scenario: it succeeds, and its transcript is that of the .expected file beside
# it. Both files are found by listing the folder. The lines of a .options file are arguments.
file(GLOB scenarios CONFIGURE_DEPENDS ${scenarios_dir}/*.scenario)
foreach(scenario IN LISTS scenarios)
    get_filename_component(name ${scenario} NAME_WE)
    set(options "")
    if(EXISTS ${scenarios_dir}/${name}.options)
        file(STRINGS ${scenarios_dir}/${name}.options options)
        set_property(DIRECTORY APPEND PROPERTY
            CMAKE_CONFIGURE_DEPENDS ${scenarios_dir}/${name}.options)
    endif()
    hmi_add_output_test(scenario-${name}
        COMMAND headunit --headless ${options} ${name}.scenario
        EXPECTED ${scenarios_dir}/${name}.expected
        DIRECTORY ${scenarios_dir}
        LABELS scenarios)
endforeach()

# The same scenario as another system's editor saves it.
file(READ ${scenarios_dir}/language.scenario text)
string(REPLACE "\n" "\r\n" text "${text}")
string(ASCII 239 187 191 byte_order_mark)
file(WRITE ${CMAKE_CURRENT_BINARY_DIR}/language-crlf.scenario "${byte_order_mark}${text}")
hmi_add_output_test(scenario-language-crlf
    COMMAND headunit --headless --scenario ${CMAKE_CURRENT_BINARY_DIR}/language-crlf.scenario
    EXPECTED ${scenarios_dir}/language.expected
    LABELS scenarios)

# One test for each way to fail: <case>.expected is what must stand on stderr. The case is a
# scenario of that name, which fails with exit code 1, or a file <case>.arguments: an exit code, and
# below it a command line with an argument a line. Where there is a <case>.transcript, stdout is
# compared with it as well.
file(GLOB faults CONFIGURE_DEPENDS ${faults_dir}/*.expected)
foreach(fault IN LISTS faults)
    get_filename_component(name ${fault} NAME_WE)
    set(arguments 1 ${name}.scenario)
    if(EXISTS ${faults_dir}/${name}.arguments)
        file(STRINGS ${faults_dir}/${name}.arguments arguments)
        set_property(DIRECTORY APPEND PROPERTY
            CMAKE_CONFIGURE_DEPENDS ${faults_dir}/${name}.arguments)
    endif()
    list(POP_FRONT arguments exit_code)
    hmi_add_output_test(fault-${name}
        COMMAND headunit --headless ${arguments}
        EXPECTED ${fault}
        EXIT_CODE ${exit_code}
        STREAM stderr
        DIRECTORY ${faults_dir}
        LABELS faults)
endforeach()

file(GLOB transcripts CONFIGURE_DEPENDS ${faults_dir}/*.transcript)
foreach(transcript IN LISTS transcripts)
    get_filename_component(name ${transcript} NAME_WE)
    hmi_add_output_test(fault-${name}-transcript
        COMMAND headunit --headless ${name}.scenario
        EXPECTED ${transcript}
        EXIT_CODE 1
        DIRECTORY ${faults_dir}
        LABELS faults)
endforeach()

# A case without its other half would never be run.
file(GLOB inputs CONFIGURE_DEPENDS ${faults_dir}/*.scenario ${faults_dir}/*.arguments)
foreach(input IN LISTS inputs)
    get_filename_component(name ${input} NAME_WE)
    if(NOT EXISTS ${faults_dir}/${name}.expected)
        message(FATAL_ERROR "${input} has no ${name}.expected beside it")
    endif()
endforeach()

hmi_add_output_test(headunit-list
    COMMAND headunit --headless --list
    EXPECTED ${CMAKE_CURRENT_SOURCE_DIR}/tests/list.expected
    LABELS examples)
hmi_add_output_test(headunit-inventory
    COMMAND headunit --headless --inventory
    EXPECTED ${CMAKE_CURRENT_SOURCE_DIR}/inventory.json
    LABELS examples)

# The rules are without a fault, whether it is known what they are for or not.
if(HMISTATEMACHINE_WITH_RULES_TOOL)
    hmi_add_output_test(headunit-rules
        COMMAND hmi-rules lint --fail-on note interruptions.json
        EXPECTED ${CMAKE_CURRENT_SOURCE_DIR}/tests/no-findings.expected
        LABELS examples)
    hmi_add_output_test(headunit-rules-inventory
        COMMAND hmi-rules lint --fail-on note --inventory inventory.json interruptions.json
        EXPECTED ${CMAKE_CURRENT_SOURCE_DIR}/tests/no-findings.expected
        LABELS examples)
else()
    message(STATUS "Tests of the head unit's rules: off, because they need hmi-rules")
endif()

add_test(NAME headunit-help COMMAND headunit --headless --help)
add_test(NAME headunit-verbose COMMAND headunit --headless --verbose ${scenarios_dir}/voice.scenario)
set_tests_properties(headunit-help headunit-verbose PROPERTIES LABELS examples TIMEOUT 30)
set_tests_properties(headunit-help PROPERTIES
    PASS_REGULAR_EXPRESSION "wait MILLISECONDS.*--scenario <FILE>.*--list")
set_tests_properties(headunit-verbose PROPERTIES
    PASS_REGULAR_EXPRESSION "Entering state: \"Unnamed->HeadUnit->Screens->Internal->Exclusive->Media->Media/Player\"")
