hmi_add_test(lifetime lifetime)
target_sources(tst_lifetime PRIVATE
    lifetime/household.cpp
    lifetime/household.h
    lifetime/householdadditions.cpp
    lifetime/householdevents.cpp
    random/seeds.cpp
    random/seeds.h)
target_include_directories(tst_lifetime PRIVATE lifetime ${CMAKE_CURRENT_SOURCE_DIR})
set_tests_properties(lifetime PROPERTIES TIMEOUT 120 ENVIRONMENT "${HMI_LOST_EVENTS}")
