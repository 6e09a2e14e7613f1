# Decides whether the tool for interruption rules is built: HMISTATEMACHINE_WITH_RULES_TOOL.

set(HMISTATEMACHINE_WITH_RULES_TOOL OFF)
if(HMISTATEMACHINE_BUILD_RULES_TOOL STREQUAL "AUTO")
    find_package(nlohmann_json 3.10 QUIET)
    find_package(CLI11 2.1 QUIET)
    if(nlohmann_json_FOUND AND CLI11_FOUND)
        set(HMISTATEMACHINE_WITH_RULES_TOOL ON)
    endif()
elseif(HMISTATEMACHINE_BUILD_RULES_TOOL)
    find_package(nlohmann_json 3.10 REQUIRED)
    find_package(CLI11 2.1 REQUIRED)
    set(HMISTATEMACHINE_WITH_RULES_TOOL ON)
endif()
message(STATUS "Tool for interruption rules, hmi-rules: ${HMISTATEMACHINE_WITH_RULES_TOOL} "
    "(HMISTATEMACHINE_BUILD_RULES_TOOL=${HMISTATEMACHINE_BUILD_RULES_TOOL})")
