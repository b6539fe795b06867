# How every target of the tree is made: one set of warnings, one include root, one precompiled header.

add_library(orx_build_options INTERFACE)
target_compile_options(orx_build_options INTERFACE
  -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Werror)
if(ORX_SANITIZE)
  target_compile_options(orx_build_options INTERFACE
    -fsanitize=address,undefined -fno-sanitize-recover=undefined -fno-omit-frame-pointer)
  target_link_options(orx_build_options INTERFACE -fsanitize=address,undefined)
endif()
if(ORX_BUILD_FUZZ)
  if(NOT CMAKE_CXX_COMPILER_ID MATCHES "Clang")
    message(FATAL_ERROR "ORX_BUILD_FUZZ needs clang; take the preset fuzz")
  endif()
  target_compile_options(orx_build_options INTERFACE -fsanitize=fuzzer-no-link)
endif()
target_compile_definitions(orx_build_options INTERFACE
  QT_NO_CAST_TO_ASCII QT_NO_CAST_FROM_BYTEARRAY QT_NO_KEYWORDS QT_NO_URL_CAST_FROM_STRING QT_DEPRECATED_WARNINGS)

function(_orx_setup target)
  target_include_directories(${target} PUBLIC $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>)
  target_link_libraries(${target} PRIVATE $<BUILD_INTERFACE:orx_build_options>)
  target_precompile_headers(${target} PRIVATE ${PROJECT_SOURCE_DIR}/cmake/Precompiled.h)
endfunction()

function(_orx_sources out)
  file(GLOB_RECURSE sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp ${CMAKE_CURRENT_SOURCE_DIR}/*.h)
  set(${out} ${sources} PARENT_SCOPE)
endfunction()

# What all shared libraries have in common: a versioned name, the name users link by, only marked symbols visible.
function(_orx_shared_library target export_name)
  set_target_properties(${target} PROPERTIES
    VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR} EXPORT_NAME ${export_name}
    LINK_DEPENDS ${PROJECT_SOURCE_DIR}/cmake/exports.map)
  target_compile_features(${target} PUBLIC cxx_std_17)
  target_link_options(${target} PRIVATE LINKER:--version-script=${PROJECT_SOURCE_DIR}/cmake/exports.map)
  if(NOT ORX_SANITIZE)
    # The sanitizers' own symbols come with the program.
    target_link_options(${target} PRIVATE LINKER:--no-undefined)
  endif()
endfunction()

# A stand-in for an in-house library: shared, so that the real one can take its place at link time.
function(orx_platform_library name)
  _orx_sources(sources)
  add_library(${name} SHARED ${sources})
  _orx_setup(${name})
  _orx_shared_library(${name} ${name})
  target_link_libraries(${name} PUBLIC Qt5::Core ${ARGN})
endfunction()

# One floor of the library: the sources of a folder and its rooms, made into an archive that knows only the floors below.
function(orx_floor name)
  _orx_sources(sources)
  add_library(${name} STATIC ${sources})
  set_property(GLOBAL APPEND PROPERTY ORX_FLOORS ${name})
  _orx_setup(${name})
  target_link_libraries(${name} PUBLIC Qt5::Core ${ARGN})
endfunction()

# The tests of one floor, in tests/<folder>; each is run once and reports its own cases.
function(orx_test name)
  _orx_sources(sources)
  if(NOT sources)
    return()
  endif()
  add_executable(${name} ${sources})
  _orx_setup(${name})
  target_link_libraries(${name} PRIVATE ${ARGN} GTest::gtest GTest::gtest_main)
  target_compile_definitions(${name} PRIVATE
    ORX_SOURCE_DIR="${PROJECT_SOURCE_DIR}" ORX_BINARY_DIR="${CMAKE_BINARY_DIR}")
  add_test(NAME ${name} COMMAND ${name})
  set_tests_properties(${name} PROPERTIES
    ENVIRONMENT "ORX_HOME=${PROJECT_SOURCE_DIR}/resources;QT_LOGGING_TO_CONSOLE=1" TIMEOUT 600)
endfunction()

# One benchmark program per source file of bench/.
function(orx_bench name)
  add_executable(${name} ${name}.cpp)
  _orx_setup(${name})
  target_link_libraries(${name} PRIVATE ${ARGN} benchmark::benchmark)
  target_compile_definitions(${name} PRIVATE ORX_SOURCE_DIR="${PROJECT_SOURCE_DIR}")
endfunction()
