find_package(Threads REQUIRED)
hmi_add_test(threads postingthreads)
hmi_add_test(threads registrythreads)
foreach(name IN ITEMS postingthreads registrythreads)
    target_link_libraries(tst_${name} PRIVATE Threads::Threads)
endforeach()
target_sources(tst_registrythreads PRIVATE
    threads/contest.cpp
    threads/contest.h
    threads/contestant.cpp
    threads/contestant.h)

if(HMISTATEMACHINE_SANITIZE MATCHES thread)
    # The sanitizer does not start where the kernel scatters addresses widely.
    execute_process(COMMAND setarch --addr-no-randomize true
        RESULT_VARIABLE refused OUTPUT_QUIET ERROR_QUIET)
    foreach(name IN ITEMS postingthreads registrythreads)
        target_sources(tst_${name} PRIVATE threads/tsanlocks.cpp)
        target_link_libraries(tst_${name} PRIVATE ${CMAKE_DL_LIBS})
        if(NOT refused)
            set_target_properties(tst_${name} PROPERTIES
                CROSSCOMPILING_EMULATOR "setarch;--addr-no-randomize")
        endif()
    endforeach()
    set(suppressions suppressions=${CMAKE_CURRENT_SOURCE_DIR}/threads/suppressions.tsan)
    set_tests_properties(registrythreads PROPERTIES ENVIRONMENT
        "HMI_THREADS_MS=10000;TSAN_OPTIONS=${suppressions}")
    # The queue of the machine, and the memory that it takes, are Qt's own.
    set_tests_properties(postingthreads PROPERTIES ENVIRONMENT
        "TSAN_OPTIONS=ignore_noninstrumented_modules=1:${suppressions}")
endif()
