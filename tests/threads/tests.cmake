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
    foreach(name IN ITEMS postingthreads registrythreads)
        target_sources(tst_${name} PRIVATE threads/tsanlocks.cpp)
        target_link_libraries(tst_${name} PRIVATE ${CMAKE_DL_LIBS})
    endforeach()
    set(suppressions suppressions=${CMAKE_CURRENT_SOURCE_DIR}/threads/suppressions.tsan)
    set_tests_properties(registrythreads PROPERTIES ENVIRONMENT
        "HMI_THREADS_MS=10000;TSAN_OPTIONS=${suppressions}")
    # The queue of the machine, and the memory that it takes, are Qt's own.
    set_tests_properties(postingthreads PROPERTIES ENVIRONMENT
        "TSAN_OPTIONS=ignore_noninstrumented_modules=1:${suppressions}")
endif()
