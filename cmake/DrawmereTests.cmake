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
    gtest_discover_tests(${folder}_test
        TEST_PREFIX ${folder}.
        NO_PRETTY_VALUES
        DISCOVERY_TIMEOUT 60
        PROPERTIES TIMEOUT 120
    )
endfunction()
