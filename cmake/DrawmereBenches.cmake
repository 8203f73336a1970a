# Benchmarks: one program each, all run by the target `run_benches` and each once, shortened, as a
# test.

find_package(benchmark REQUIRED)

# drawmere_add_bench(<name> <sources...>) builds the program <name>. In the test run it finds
# DRAWMERE_BENCH_SMOKE in its environment and takes a small workload.
function(drawmere_add_bench name)
    add_executable(${name} ${ARGN})
    target_link_libraries(${name} PRIVATE mox drawmere_objects benchmark::benchmark)
    set_property(GLOBAL APPEND PROPERTY DRAWMERE_BENCH_TARGETS ${name})
    if(DRAWMERE_TESTS)
        add_test(NAME bench.${name} COMMAND ${name} --benchmark_min_time=0.001)
        set_tests_properties(bench.${name} PROPERTIES
            ENVIRONMENT DRAWMERE_BENCH_SMOKE=1
            TIMEOUT 120
        )
    endif()
endfunction()

# drawmere_finish_benches() makes `run_benches`: every bench in full, one after the other.
function(drawmere_finish_benches)
    get_property(benches GLOBAL PROPERTY DRAWMERE_BENCH_TARGETS)
    if(NOT benches)
        return()
    endif()
    set(commands)
    foreach(bench IN LISTS benches)
        list(APPEND commands COMMAND ${CMAKE_COMMAND} -E echo "== ${bench}" COMMAND ${bench})
    endforeach()
    add_custom_target(run_benches ${commands}
        WORKING_DIRECTORY ${CMAKE_CURRENT_BINARY_DIR}
        DEPENDS ${benches}
        USES_TERMINAL
        VERBATIM
    )
endfunction()
