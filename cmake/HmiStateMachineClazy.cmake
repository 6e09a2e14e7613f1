# Has Clang look for misuse of Qt while it compiles, which takes hardly longer. What is off:
#
# fully-qualified-moc-types, ctor-missing-parent-argument, function-args-by-ref
#     types as the interface writes them; the parent of a state is a state; values as moc passes them
# copyable-polymorphic
#     events, since QEvent is copyable; interfaces, of which nobody makes a copy

set(HMI_CLAZY_CHECKS level2
    no-copyable-polymorphic
    no-ctor-missing-parent-argument
    no-fully-qualified-moc-types
    no-function-args-by-ref)

if(HMISTATEMACHINE_CLAZY AND NOT CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
    message(FATAL_ERROR "HMISTATEMACHINE_CLAZY needs Clang; this is ${CMAKE_CXX_COMPILER_ID}.")
endif()

# For the library and its scene, which run in a car. A program may allocate a text.
function(hmi_target_clazy target)
    cmake_path(SET library ${PROJECT_SOURCE_DIR}/src)
    cmake_path(IS_PREFIX library ${CMAKE_CURRENT_SOURCE_DIR} in_library)
    if(NOT HMISTATEMACHINE_CLAZY OR NOT in_library)
        return()
    endif()
    list(JOIN HMI_CLAZY_CHECKS "," checks)
    target_compile_options(${target} PRIVATE
        "SHELL:-Xclang -load -Xclang ClazyPlugin.so -Xclang -add-plugin -Xclang clazy"
        "SHELL:-Xclang -plugin-arg-clazy -Xclang ${checks}")
endfunction()
