# What can be chosen, and what is looked for on the machine.

option(DRAWMERE_WERROR "Treat warnings as errors" OFF)
option(DRAWMERE_TESTS "Build the tests" ${PROJECT_IS_TOP_LEVEL})
option(DRAWMERE_EXAMPLES "Build the examples" ${PROJECT_IS_TOP_LEVEL})
option(DRAWMERE_BENCHES "Build the benchmarks" ${PROJECT_IS_TOP_LEVEL})
option(DRAWMERE_CONVERT "Build the converter, for which MuPDF must be there" OFF)
option(DRAWMERE_FUZZ "Build the fuzz targets (clang with libFuzzer)" OFF)
option(DRAWMERE_LTO "Optimise across sources when the compiler can" OFF)
set(DRAWMERE_SANITIZE "" CACHE STRING "Sanitizers of the whole build, as -fsanitize takes them")

if(NOT CMAKE_BUILD_TYPE AND NOT CMAKE_CONFIGURATION_TYPES)
    set(CMAKE_BUILD_TYPE RelWithDebInfo CACHE STRING "Kind of build" FORCE)
endif()

set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)

# What ccache keeps stands in the user's home: without one it refuses to compile.
find_program(CCACHE ccache)
if(CCACHE AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
    file(WRITE ${PROJECT_BINARY_DIR}/CMakeFiles/ccache.cpp "")
    execute_process(COMMAND ${CCACHE} ${CMAKE_CXX_COMPILER} -c ccache.cpp -o ccache.o
        WORKING_DIRECTORY ${PROJECT_BINARY_DIR}/CMakeFiles
        RESULT_VARIABLE refusal
        ERROR_QUIET
    )
    if(refusal EQUAL 0)
        # Without these words a source that uses a precompiled header never hits the cache.
        set(CMAKE_CXX_COMPILER_LAUNCHER env CCACHE_SLOPPINESS=pch_defines,time_macros ${CCACHE})
    endif()
endif()

find_package(PkgConfig REQUIRED)
find_package(ICU REQUIRED COMPONENTS uc i18n)
find_package(GIF REQUIRED)
find_package(JPEG REQUIRED)
find_package(PNG REQUIRED)
find_package(TIFF REQUIRED)
find_package(Threads REQUIRED)
find_package(ZLIB REQUIRED)
find_path(STB_INCLUDE_DIR stb_image_resize.h PATH_SUFFIXES stb REQUIRED)
pkg_check_modules(FONTCONFIG REQUIRED IMPORTED_TARGET fontconfig)
pkg_check_modules(FREETYPE REQUIRED IMPORTED_TARGET freetype2)
pkg_check_modules(HARFBUZZ REQUIRED IMPORTED_TARGET harfbuzz)
pkg_check_modules(URIPARSER REQUIRED IMPORTED_TARGET liburiparser)
pkg_check_modules(WEBP REQUIRED IMPORTED_TARGET libwebp libwebpdemux)

if(DRAWMERE_LTO)
    include(CheckIPOSupported)
    check_ipo_supported(RESULT DRAWMERE_LTO_WORKS LANGUAGES CXX)
    set(CMAKE_INTERPROCEDURAL_OPTIMIZATION ${DRAWMERE_LTO_WORKS})
endif()

# Without MuPDF everything but the converter is built.
find_path(MUPDF_INCLUDE_DIR mupdf/fitz.h)
find_library(MUPDF_LIBRARY mupdf)
find_path(CLI11_INCLUDE_DIR CLI/CLI.hpp)
set(DRAWMERE_CAN_CONVERT OFF)
if(MUPDF_INCLUDE_DIR AND MUPDF_LIBRARY AND CLI11_INCLUDE_DIR)
    set(DRAWMERE_CAN_CONVERT ON)
elseif(DRAWMERE_CONVERT)
    message(FATAL_ERROR "The converter needs libmupdf-dev and libcli11-dev")
endif()
