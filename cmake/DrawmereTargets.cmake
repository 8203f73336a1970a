# The targets: `mox` for foundation/, `drawmere_objects` for every other folder, and the shared
# library `drawmere` made of both. Each folder adds its sources to one of the first two.

# How everything in this repository is compiled.
add_library(drawmere_flags INTERFACE)
target_compile_options(drawmere_flags INTERFACE
    -Wall
    -Wextra
    -Wpedantic
    -Wshadow
    -Wconversion
    -Wdouble-promotion
    -Wold-style-cast
    -Wcast-qual
    -Wnon-virtual-dtor
    -Woverloaded-virtual
    -Wno-sign-conversion
    -ffp-contract=off
    $<$<BOOL:${DRAWMERE_WERROR}>:-Werror>
)
target_include_directories(drawmere_flags INTERFACE
    ${PROJECT_SOURCE_DIR}
    ${PROJECT_SOURCE_DIR}/include
)
if(DRAWMERE_SANITIZE)
    target_compile_options(drawmere_flags INTERFACE
        -fsanitize=${DRAWMERE_SANITIZE}
        -fno-sanitize-recover=all
        -fno-omit-frame-pointer
    )
    target_link_options(drawmere_flags INTERFACE -fsanitize=${DRAWMERE_SANITIZE})
endif()

# What the library stands on.
add_library(drawmere_depends INTERFACE)
target_link_libraries(drawmere_depends INTERFACE
    GIF::GIF
    ICU::i18n
    ICU::uc
    JPEG::JPEG
    PNG::PNG
    PkgConfig::FONTCONFIG
    PkgConfig::FREETYPE
    PkgConfig::HARFBUZZ
    PkgConfig::URIPARSER
    PkgConfig::WEBP
    TIFF::TIFF
    Threads::Threads
    ZLIB::ZLIB
)
target_include_directories(drawmere_depends SYSTEM INTERFACE ${STB_INCLUDE_DIR})

add_library(mox OBJECT)
add_library(drawmere_objects OBJECT)
add_library(drawmere SHARED $<TARGET_OBJECTS:mox> $<TARGET_OBJECTS:drawmere_objects>)
add_library(Drawmere::drawmere ALIAS drawmere)

set_target_properties(mox drawmere_objects drawmere PROPERTIES
    POSITION_INDEPENDENT_CODE ON
    CXX_VISIBILITY_PRESET hidden
    VISIBILITY_INLINES_HIDDEN ON
)
set_target_properties(drawmere PROPERTIES
    VERSION ${PROJECT_VERSION}
    SOVERSION ${PROJECT_VERSION_MAJOR}
)
# Calls inside the library stay inside: nobody puts functions of theirs in the place of ours.
foreach(target IN ITEMS mox drawmere_objects)
    target_compile_options(${target} PRIVATE
        $<$<NOT:$<CONFIG:Debug>>:-fno-semantic-interposition>
    )
endforeach()
target_link_options(drawmere PRIVATE -Wl,-Bsymbolic-functions)
target_link_libraries(mox PUBLIC drawmere_flags drawmere_depends)
target_link_libraries(drawmere_objects PUBLIC drawmere_flags drawmere_depends)
target_link_libraries(drawmere PUBLIC ICU::uc PRIVATE drawmere_flags drawmere_depends)

# What most sources of the library include of other people's headers. Reading them takes most of
# the time of compiling a source, so they are read once for all of them. Nothing of ours is among
# them, so that this is not done again with every change. The presets `tidy` and `release` do
# without, and so see that each source includes what it needs.
set(DRAWMERE_COMMON_HEADERS
    <algorithm>
    <array>
    <cmath>
    <cstring>
    <iterator>
    <limits>
    <map>
    <memory>
    <optional>
    <ostream>
    <set>
    <span>
    <string>
    <string_view>
    <unicode/unistr.h>
    <utility>
    <vector>
)
# The first option lets ccache tell such sources apart. In them GCC 12 may also see strings overlap
# that are added up, and they never do. The converter adds up many strings, for which it sees more
# that is not there, and does without.
add_library(drawmere_precompiled INTERFACE)
target_compile_options(drawmere_precompiled INTERFACE
    $<$<CXX_COMPILER_ID:GNU>:-fpch-preprocess>
    $<$<CXX_COMPILER_ID:GNU>:-Wno-restrict>
)

# drawmere_precompile(<target> <arguments of target_precompile_headers...>) is called behind what
# links the target: the options above count only behind those of drawmere_flags.
function(drawmere_precompile target)
    target_precompile_headers(${target} ${ARGN})
    target_link_libraries(${target} PRIVATE drawmere_precompiled)
endfunction()

drawmere_precompile(mox PRIVATE ${DRAWMERE_COMMON_HEADERS})
drawmere_precompile(drawmere_objects REUSE_FROM mox)

target_compile_features(drawmere INTERFACE cxx_std_20)
target_include_directories(drawmere INTERFACE
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/include>
    $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/drawmere>
)
# The runtimes of the sanitizers come with the program, so only a plain build can ask for this.
if(NOT DRAWMERE_SANITIZE)
    target_link_options(drawmere PRIVATE -Wl,--no-undefined)
endif()

# Installs headers of the calling folder under include/drawmere/<folder>, those of include/ right
# under include/drawmere, so that every include reads the same here and there.
function(drawmere_install_headers)
    cmake_path(RELATIVE_PATH CMAKE_CURRENT_SOURCE_DIR BASE_DIRECTORY ${PROJECT_SOURCE_DIR}
        OUTPUT_VARIABLE folder)
    if(folder STREQUAL "include")
        set(folder "")
    endif()
    if(ARGN)
        set(headers ${ARGN})
        list(FILTER headers INCLUDE REGEX "\\.h$")
        list(TRANSFORM headers PREPEND "${CMAKE_CURRENT_SOURCE_DIR}/")
        set_property(GLOBAL APPEND PROPERTY DRAWMERE_HEADERS ${headers}) # those of the reference
        install(FILES ${ARGN} DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/drawmere/${folder})
    endif()
endfunction()
