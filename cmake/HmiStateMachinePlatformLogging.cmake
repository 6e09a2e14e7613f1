# Chooses where HmiLoggingCategory, hmitrace() and hmiperformance() come from.

set(HMISTATEMACHINE_PLATFORM_LOGGING_FOUND OFF)
if(HMISTATEMACHINE_PLATFORM_LOGGING STREQUAL "AUTO")
    find_package(HmiLogging QUIET)
    set(HMISTATEMACHINE_PLATFORM_LOGGING_FOUND ${HmiLogging_FOUND})
elseif(HMISTATEMACHINE_PLATFORM_LOGGING)
    find_package(HmiLogging REQUIRED)
    set(HMISTATEMACHINE_PLATFORM_LOGGING_FOUND ON)
endif()

if(HMISTATEMACHINE_PLATFORM_LOGGING_FOUND)
    message(STATUS "Logging: the platform's library (${HmiLogging_LIBRARY})")
else()
    message(STATUS "Logging: the stand-in in platform/standin "
        "(HMISTATEMACHINE_PLATFORM_LOGGING=${HMISTATEMACHINE_PLATFORM_LOGGING})")
endif()
