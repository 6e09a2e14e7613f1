# Runs PROGRAM on the project's files of rules and on what it makes of them. What it writes goes to
# FOLDER; inputs that it found in earlier runs are taken up again.

function(from_environment variable value result)
    if(DEFINED ENV{${variable}})
        set(value $ENV{${variable}})
    endif()
    set(${result} ${value} PARENT_SCOPE)
endfunction()
from_environment(HMI_FUZZ_SEED 1 seed)
from_environment(HMI_FUZZ_SECONDS 60 seconds)

file(REMOVE_RECURSE ${FOLDER}/seeds)
file(MAKE_DIRECTORY ${FOLDER}/seeds ${FOLDER}/corpus ${FOLDER}/findings)
foreach(folder IN ITEMS tests/data/interruptions tests/rules/lint examples/headunit)
    file(GLOB files ${PROJECT}/${folder}/*.json)
    string(REPLACE / - prefix ${folder})
    foreach(file IN LISTS files)
        get_filename_component(name ${file} NAME)
        file(COPY_FILE ${file} ${FOLDER}/seeds/${prefix}-${name})
    endforeach()
endforeach()
file(GLOB seeds ${FOLDER}/seeds/*.json)
if(NOT seeds)
    message(FATAL_ERROR "no files of rules are found in ${PROJECT}")
endif()

execute_process(
    COMMAND ${PROGRAM} -seed=${seed} -max_total_time=${seconds} -max_len=4096 -timeout=10
        -rss_limit_mb=2048 -print_final_stats=1 -verbosity=1
        -dict=${CMAKE_CURRENT_LIST_DIR}/rules.dict
        -artifact_prefix=${FOLDER}/findings/
        ${FOLDER}/corpus ${FOLDER}/seeds
    RESULT_VARIABLE result)
if(NOT result EQUAL 0)
    file(GLOB findings ${FOLDER}/findings/*)
    list(JOIN findings "\n  " findings)
    message(FATAL_ERROR "seed ${seed}: ${result}; inputs that fail:\n  ${findings}\n"
        "Run one of them again: ${PROGRAM} INPUT")
endif()
