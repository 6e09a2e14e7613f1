# Settings that every target built here shares: warnings, sanitizers and reproducible file names.

function(hmi_target_defaults target)
    set_target_properties(${target} PROPERTIES
        AUTOMOC ON
        CXX_EXTENSIONS OFF
        CXX_STANDARD_REQUIRED ON)
    target_compile_options(${target} PRIVATE
        -Wall -Wextra -Wpedantic -Wshadow -Woverloaded-virtual
        $<$<BOOL:${HMISTATEMACHINE_WERROR}>:-Werror>
        # Messages carry the file name of the source as it stands in the project, wherever it was built.
        -fmacro-prefix-map=${PROJECT_SOURCE_DIR}/=)
    hmi_target_clazy(${target})
    if(HMISTATEMACHINE_SANITIZE)
        target_compile_options(${target} PRIVATE
            -fsanitize=${HMISTATEMACHINE_SANITIZE} -fno-sanitize-recover=all -fno-omit-frame-pointer)
        target_link_options(${target} PRIVATE -fsanitize=${HMISTATEMACHINE_SANITIZE})
    endif()
endfunction()

# Counts which lines and branches of a target run (HMISTATEMACHINE_COVERAGE). For code that neither
# throws nor catches: the exits that the compiler adds for exceptions would count as branches.
function(hmi_target_coverage target)
    if(HMISTATEMACHINE_COVERAGE)
        target_compile_options(${target} PRIVATE --coverage -fno-exceptions)
        target_link_options(${target} PRIVATE --coverage)
    endif()
endfunction()
