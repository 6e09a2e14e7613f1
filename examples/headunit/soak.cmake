# Whether memory stays flat, in Linux's and the GNU C library's terms. A sanitizer's own bookkeeping
# would be measured, and nothing else.
if(NOT CMAKE_SYSTEM_NAME STREQUAL Linux OR HMISTATEMACHINE_SANITIZE)
    message(STATUS "The head unit's soak: off, it needs Linux and no sanitizer")
    return()
endif()

add_executable(headunit-soak
    tests/soak/main.cpp
    tests/soak/randomevents.cpp
    tests/soak/randomevents.h
    tests/soak/residentmemory.cpp
    tests/soak/residentmemory.h)
hmi_target_defaults(headunit-soak)
target_include_directories(headunit-soak PRIVATE ${PROJECT_SOURCE_DIR}/tests)
target_link_libraries(headunit-soak PRIVATE headunit_parts)

add_test(NAME headunit-soak-refuses-few-events COMMAND headunit-soak --events 1000)
set_tests_properties(headunit-soak-refuses-few-events PROPERTIES
    LABELS soak
    TIMEOUT 30
    PASS_REGULAR_EXPRESSION
        "expected a whole number from 200000 to 1000000000 for --events, found \"1000\"")

if(NOT CMAKE_BUILD_TYPE MATCHES "^(Release|RelWithDebInfo)$")
    message(STATUS "Tests of the head unit's soak: off, they need an optimised build")
    return()
endif()
add_test(NAME headunit-soak COMMAND headunit-soak --events 200000)
set_tests_properties(headunit-soak PROPERTIES LABELS soak TIMEOUT 180)

# A word lost with each event is found.
add_test(NAME headunit-soak-sees-growth COMMAND headunit-soak --events 200000 --spill 8)
set_tests_properties(headunit-soak-sees-growth PROPERTIES
    LABELS soak
    TIMEOUT 180
    PASS_REGULAR_EXPRESSION "grown: [0-9]+ KiB after [0-9]+ events, [0-9]+ KiB after 100000")
