hmi_add_test(random interruptionlookup)
hmi_add_test(random popuprandom)
hmi_add_test(random targetlookup)
foreach(name IN ITEMS interruptionlookup popuprandom targetlookup)
    target_sources(tst_${name} PRIVATE random/seeds.cpp random/seeds.h)
    # Each step costs many times more there; the seeds and the rules stay the same.
    if(HMISTATEMACHINE_SANITIZE)
        set_tests_properties(${name} PROPERTIES ENVIRONMENT HMI_RANDOM_STEPS=2000)
    endif()
endforeach()
# It is not exported, and tested for itself only in how its hashes spread.
target_sources(tst_interruptionlookup PRIVATE
    ${PROJECT_SOURCE_DIR}/src/HmiStateMachine/internal/rulename.cpp)
target_sources(tst_popuprandom PRIVATE
    random/eventwatch.cpp
    random/eventwatch.h
    random/invariants.cpp
    random/invariants.h
    random/popups.cpp
    random/popups.h
    random/rules.cpp
    random/rules.h
    random/run.cpp
    random/run.h
    random/screen.cpp
    random/screen.h
    random/snapshot.cpp
    random/snapshot.h
    random/steps.cpp
    random/steps.h
    random/world.cpp
    random/world.h)
target_include_directories(tst_popuprandom PRIVATE random)
set_tests_properties(popuprandom PROPERTIES TIMEOUT 120)
