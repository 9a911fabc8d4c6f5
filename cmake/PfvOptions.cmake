# Compiler warnings, sanitizers and the helpers every layer uses to declare targets.
include(GoogleTest)

add_library(pfv_warnings INTERFACE)
target_compile_options(pfv_warnings INTERFACE -Wall -Wextra -Wpedantic -Wnon-virtual-dtor
                                              -Woverloaded-virtual)
if(PFV_WERROR)
  target_compile_options(pfv_warnings INTERFACE -Werror)
endif()

if(PFV_SANITIZE)
  add_compile_options(-fsanitize=address,undefined -fno-omit-frame-pointer -fno-sanitize-recover=undefined)
  add_link_options(-fsanitize=address,undefined)
endif()

if(PFV_FUZZ)
  add_compile_options(-fsanitize=fuzzer-no-link)
endif()

# pfv_layer(<name> SOURCES ... PUBLIC_DEPS ... PRIVATE_DEPS ...): a shared library whose public
# headers live in include/ beside its sources.
function(pfv_layer name)
  cmake_parse_arguments(ARG "" "" "SOURCES;PUBLIC_DEPS;PRIVATE_DEPS" ${ARGN})
  add_library(${name} SHARED ${ARG_SOURCES})
  target_include_directories(${name} PUBLIC ${CMAKE_CURRENT_SOURCE_DIR}/include
                                     PRIVATE ${CMAKE_CURRENT_SOURCE_DIR}/src)
  target_link_libraries(${name} PUBLIC ${ARG_PUBLIC_DEPS} PRIVATE pfv_warnings ${ARG_PRIVATE_DEPS})
endfunction()

# pfv_init_main(<out-var> <name> <gtest|benchmark> <layer>...): writes the main of a test or
# benchmark program that initialises the named layers (VORInit<layer>()) first, as the program
# does; returns its path.
function(pfv_init_main out name kind)
  set(includes "")
  set(calls "")
  foreach(layer IN LISTS ARGN)
    string(APPEND includes "#include \"VOR${layer}Init.h\"\n")
    string(APPEND calls "  VORInit${layer}();\n")
  endforeach()
  if(kind STREQUAL "gtest")
    set(header "#include <gmock/gmock.h>")
    set(start "  ::testing::InitGoogleMock(&argc, argv);\n")
    set(run "  return RUN_ALL_TESTS();\n")
  else()
    set(header "#include <benchmark/benchmark.h>")
    set(start "  ::benchmark::Initialize(&argc, argv);\n")
    set(run "  ::benchmark::RunSpecifiedBenchmarks();\n  ::benchmark::Shutdown();\n  return 0;\n")
  endif()
  set(main ${CMAKE_CURRENT_BINARY_DIR}/${name}_main.cpp)
  file(CONFIGURE OUTPUT ${main} @ONLY CONTENT
"// Generated: initialises the platform layers ${name} uses, then runs it.
${header}

${includes}
int main(int argc, char** argv) {
${start}${calls}${run}}
")
  set(${out} ${main} PARENT_SCOPE)
endfunction()


# pfv_test(<name> SOURCES ... LIBS ... [INIT <layer>...]): a GoogleTest executable whose test
# cases ctest lists one by one, run with the bundled resources and the built modules. Its main
# initialises the named platform layers (Kernel, Model, ..., Pert, Qt) before any test. The
# environment is given by a launcher rather than by test properties, so that listing the cases
# sees the same environment as running them. Cases of one executable share
# a settings folder, so they never run at once.
function(pfv_test name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBS;INIT" ${ARGN})
  pfv_init_main(main ${name} gtest ${ARG_INIT})
  add_executable(${name} ${ARG_SOURCES} ${main})
  target_link_libraries(${name} PRIVATE pfv_warnings GTest::gtest GTest::gmock ${ARG_LIBS})
  pfv_use_product_heap(${name})
  set_target_properties(${name} PROPERTIES CROSSCOMPILING_EMULATOR
    "${CMAKE_COMMAND};-E;env;VORStartupPath=${PFV_RESOURCE_DIR};VOR_MODULE_PATH=${PFV_MODULE_DIR};VOR_USER_SETTINGS_DIR=${CMAKE_BINARY_DIR}/test-settings/${name};PFV_TEST_DATA=${CMAKE_SOURCE_DIR}/tests/data;PFV_EXAMPLES=${CMAKE_SOURCE_DIR}/examples;QT_QPA_PLATFORM=offscreen;ASAN_OPTIONS=detect_leaks=1;LSAN_OPTIONS=suppressions=${CMAKE_SOURCE_DIR}/tests/qt-leaks.supp")
  # Cases are listed when ctest starts (not after linking), with a generous time-out: a
  # sanitizer build starts slowly on a busy machine.
  gtest_discover_tests(${name} TEST_PREFIX "${name}." DISCOVERY_MODE PRE_TEST
                       DISCOVERY_TIMEOUT 120 PROPERTIES RESOURCE_LOCK ${name})
endfunction()

# pfv_bench(<name> SOURCES ... LIBS ... [INIT <layer>...]): a Google Benchmark program whose main
# initialises the named layers first.
function(pfv_bench name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBS;INIT" ${ARGN})
  pfv_init_main(main ${name} benchmark ${ARG_INIT})
  add_executable(${name} ${ARG_SOURCES} ${main})
  target_link_libraries(${name} PRIVATE pfv_warnings benchmark::benchmark ${ARG_LIBS})
  pfv_use_product_heap(${name})
endfunction()

# pfv_check_headers(<name> <target> <folder>): every header of folder compiles on its own, with
# only the include paths and definitions of target: the object library <name>_headers of one
# generated one-line source per header.
function(pfv_check_headers name target folder)
  file(GLOB headers CONFIGURE_DEPENDS ${folder}/*.h)
  set(sources "")
  foreach(header IN LISTS headers)
    get_filename_component(stem ${header} NAME_WE)
    set(source ${CMAKE_BINARY_DIR}/header-check/${name}/${stem}.cpp)
    file(CONFIGURE OUTPUT ${source} CONTENT "#include \"${stem}.h\"\n")
    list(APPEND sources ${source})
  endforeach()
  add_library(${name}_headers OBJECT ${sources})
  target_link_libraries(${name}_headers PRIVATE ${target} pfv_warnings)
endfunction()
