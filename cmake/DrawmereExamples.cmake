# Examples are programs as a caller writes them: they know the shared library alone.

if(DRAWMERE_TESTS)
    find_program(XMLLINT xmllint REQUIRED)
endif()

# drawmere_add_example(<name>) builds <name>.cpp. The example writes into its working directory;
# tests run it, then ask whether what it wrote is well-formed and valid SVG 1.1.
function(drawmere_add_example name)
    add_executable(${name} ${name}.cpp)
    target_link_libraries(${name} PRIVATE drawmere drawmere_flags)
    target_compile_definitions(${name} PRIVATE EXAMPLE_DATA="${CMAKE_CURRENT_SOURCE_DIR}/data")
    if(NOT DRAWMERE_TESTS)
        return()
    endif()
    set(written ${CMAKE_CURRENT_BINARY_DIR}/out/${name})
    file(MAKE_DIRECTORY ${written})
    add_test(NAME examples.${name} COMMAND ${name} WORKING_DIRECTORY ${written})
    set_tests_properties(examples.${name} PROPERTIES FIXTURES_SETUP ${name} TIMEOUT 120)
    # The validator says the same of the same bytes, whatever wrote them.
    if(NOT DRAWMERE_SANITIZE)
        drawmere_lint_example(${name} wellformed --noout)
        drawmere_lint_example(${name} valid --noout --dtdvalidfpi "-//W3C//DTD SVG 1.1//EN")
    endif()
    drawmere_add_example_for_profiles(${name})
endfunction()

function(drawmere_lint_example name claim)
    add_test(NAME examples.${name}.${claim}
        COMMAND ${PROJECT_SOURCE_DIR}/cmake/lint_example ${XMLLINT} ${ARGN}
        WORKING_DIRECTORY ${CMAKE_CURRENT_BINARY_DIR}/out/${name}
    )
    set_tests_properties(examples.${name}.${claim} PROPERTIES FIXTURES_REQUIRED ${name})
endfunction()

# The same source once more, with the header in front that lets a test choose the output profile.
function(drawmere_add_example_for_profiles name)
    add_executable(${name}_profiles ${name}.cpp)
    # Whatever the example is given later on as well.
    target_link_libraries(${name}_profiles PRIVATE $<TARGET_PROPERTY:${name},LINK_LIBRARIES>)
    target_compile_definitions(${name}_profiles PRIVATE
        $<TARGET_PROPERTY:${name},COMPILE_DEFINITIONS>
    )
    target_compile_options(${name}_profiles PRIVATE
        "SHELL:-include ${PROJECT_SOURCE_DIR}/tests/profiles/ProfileConfig.h"
    )
    set_target_properties(${name}_profiles PROPERTIES
        RUNTIME_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/tests/profiles
        RUNTIME_OUTPUT_NAME ${name}
    )
    set_property(GLOBAL APPEND PROPERTY DRAWMERE_EXAMPLES ${name})
endfunction()

# drawmere_finish_examples() adds the test that runs every example in every profile.
function(drawmere_finish_examples)
    if(DRAWMERE_TESTS)
        add_subdirectory(${PROJECT_SOURCE_DIR}/tests/profiles ${PROJECT_BINARY_DIR}/tests/profiles)
    endif()
endfunction()
