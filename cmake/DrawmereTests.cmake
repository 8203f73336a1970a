# One test binary a folder, linked with the object libraries and so reaching what the shared
# library hides.

include(GoogleTest)
find_package(GTest REQUIRED)
pkg_check_modules(CAIRO REQUIRED IMPORTED_TARGET cairo)
pkg_check_modules(XML2 REQUIRED IMPORTED_TARGET libxml-2.0)

# drawmere_add_test(<folder> <sources...>) makes `<folder>_test` and registers each of its tests as
# "<folder>.<suite>.<test>". A folder without tests makes nothing.
function(drawmere_add_test folder)
    if(ARGN)
        drawmere_add_plain_test(${folder} ${ARGN})
        target_link_libraries(${folder}_test PRIVATE mox drawmere_objects)
    endif()
endfunction()

# The same without the library, for tests that judge the sources.
function(drawmere_add_plain_test folder)
    add_executable(${folder}_test ${ARGN})
    target_link_libraries(${folder}_test PRIVATE test_support)
    target_precompile_headers(${folder}_test REUSE_FROM test_support)
    if(DRAWMERE_SANITIZE)
        drawmere_register_shares(${folder} ${ARGN})
    else()
        gtest_discover_tests(${folder}_test
            TEST_PREFIX ${folder}.
            NO_PRETTY_VALUES
            DISCOVERY_TIMEOUT 60
            PROPERTIES TIMEOUT 300
        )
    endif()
endfunction()

# With a sanitizer the start of a process takes longer than most tests do. There the tests of a
# folder are dealt out to a few processes, "<folder>.1of3", and meet what earlier ones left behind;
# that each passes by itself is seen in the other builds.
function(drawmere_register_shares folder)
    list(LENGTH ARGN sources)
    math(EXPR shares "${sources} / 8 + 2")
    foreach(share RANGE 1 ${shares})
        set(name ${folder}.${share}of${shares})
        math(EXPR index "${share} - 1")
        add_test(NAME ${name} COMMAND ${folder}_test)
        set_tests_properties(${name} PROPERTIES
            ENVIRONMENT "GTEST_TOTAL_SHARDS=${shares};GTEST_SHARD_INDEX=${index}"
            TIMEOUT 600
        )
    endforeach()
endfunction()

# drawmere_run_first(<test>...) names tests that take long: started last, they would be waited for.
function(drawmere_run_first)
    set_tests_properties(${ARGN} PROPERTIES COST 1000)
endfunction()
