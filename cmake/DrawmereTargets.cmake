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
target_compile_options(mox PRIVATE $<$<NOT:$<CONFIG:Debug>>:-fno-semantic-interposition>)
target_compile_options(drawmere_objects PRIVATE $<$<NOT:$<CONFIG:Debug>>:-fno-semantic-interposition>)
target_link_options(drawmere PRIVATE -Wl,-Bsymbolic-functions)
target_link_libraries(mox PUBLIC drawmere_flags drawmere_depends)
target_link_libraries(drawmere_objects PUBLIC drawmere_flags drawmere_depends)
target_link_libraries(drawmere PUBLIC ICU::uc PRIVATE drawmere_flags drawmere_depends)
target_compile_features(drawmere INTERFACE cxx_std_20)
target_include_directories(drawmere INTERFACE
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/include>
    $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/drawmere>
)
# Nobody puts other functions in the place of the library's own, so calls among them go straight.
target_link_options(drawmere PRIVATE -Wl,-Bsymbolic-functions)
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
