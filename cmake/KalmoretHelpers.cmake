# Shared build settings and small helpers for Kalmoret's targets.

# Compiler flags every Kalmoret target gets. The float arithmetic of the geometry must be exactly
# IEEE single/double as written: no contraction into fused multiply-adds, no fast-math.
add_library(kalmoret_options INTERFACE)
target_compile_options(kalmoret_options INTERFACE
  $<$<CXX_COMPILER_ID:GNU,Clang>:-Wall -Wextra -Wshadow -Wconversion -Wno-sign-conversion
                                 -ffp-contract=off>
  $<$<AND:$<CXX_COMPILER_ID:GNU,Clang>,$<BOOL:${KALMORET_WERROR}>>:-Werror>)

# kalmoret_add_library(NAME SOURCES... [DEPS targets...])
# A static library of one plug-in folder; its headers are included as "folder/Header.h".
function(kalmoret_add_library name)
  cmake_parse_arguments(ARG "" "" "SOURCES;DEPS" ${ARGN})
  add_library(${name} STATIC ${ARG_SOURCES})
  target_include_directories(${name} PUBLIC ${PROJECT_SOURCE_DIR})
  target_link_libraries(${name} PUBLIC kalmoret_options ${ARG_DEPS})
endfunction()

# kalmoret_add_test(NAME SOURCES... [DEPS targets...])
# One GoogleTest program, its cases discovered by CTest.
function(kalmoret_add_test name)
  cmake_parse_arguments(ARG "" "" "SOURCES;DEPS" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE kalmoret_options ${ARG_DEPS} GTest::gmock GTest::gtest_main)
  target_compile_definitions(${name} PRIVATE
    KALMORET_TESTDATA_DIR="${KALMORET_TESTDATA_DIR}")
  kalmoret_discover_tests(${name})
endfunction()

# kalmoret_discover_tests(TARGET [PROPERTIES ...])
# Registers a GoogleTest program's cases with CTest. A cross build lists them when ctest runs
# (through the emulator, whose first start may be slow) rather than at build time.
function(kalmoret_discover_tests name)
  if(CMAKE_CROSSCOMPILING)
    gtest_discover_tests(${name} DISCOVERY_MODE PRE_TEST DISCOVERY_TIMEOUT 180 ${ARGN})
  else()
    gtest_discover_tests(${name} DISCOVERY_TIMEOUT 60 ${ARGN})
  endif()
endfunction()

# kalmoret_add_bench(NAME SOURCES... [DEPS targets...])
function(kalmoret_add_bench name)
  cmake_parse_arguments(ARG "" "" "SOURCES;DEPS" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE kalmoret_options ${ARG_DEPS} benchmark::benchmark)
endfunction()

# kalmoret_add_fuzzer(NAME SOURCES... [DEPS targets...])
# A libFuzzer target; scripts/fuzz.sh runs it on its seed corpus in fuzz/corpus/<name without _fuzz>.
function(kalmoret_add_fuzzer name)
  cmake_parse_arguments(ARG "" "" "SOURCES;DEPS" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_compile_options(${name} PRIVATE -fsanitize=fuzzer)
  target_link_options(${name} PRIVATE -fsanitize=fuzzer)
  target_link_libraries(${name} PRIVATE kalmoret_options ${ARG_DEPS})
endfunction()

# kalmoret_add_resources(TARGET RC_FILE HEADER)
# Builds a resource script into the module TARGET. Windows: the resource compiler. Elsewhere: a build
# step (StandInResources.cmake) turns the script into the stand-in's exported resource table, found by
# LoadStringA and LoadBitmapA through the module's handle; an executable must then export its
# symbols (ENABLE_EXPORTS).
function(kalmoret_add_resources target rc header)
  if(WIN32)
    target_sources(${target} PRIVATE ${rc})
    return()
  endif()
  get_filename_component(folder ${rc} DIRECTORY)
  file(GLOB bitmaps CONFIGURE_DEPENDS ${folder}/*.bmp)
  set(table ${CMAKE_CURRENT_BINARY_DIR}/${target}_resources.cpp)
  add_custom_command(
    OUTPUT ${table}
    COMMAND ${CMAKE_COMMAND} -DRC_FILE=${rc} -DHEADER=${header} -DOUTPUT=${table}
            -P ${PROJECT_SOURCE_DIR}/cmake/StandInResources.cmake
    DEPENDS ${rc} ${header} ${bitmaps} ${PROJECT_SOURCE_DIR}/cmake/StandInResources.cmake
    COMMENT "Generating the resource table of ${target}"
    VERBATIM)
  target_sources(${target} PRIVATE ${table})
endfunction()
