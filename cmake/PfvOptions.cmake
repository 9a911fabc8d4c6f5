# Compiler warnings, sanitizers and the helpers every layer uses to declare targets.

add_library(pfv_warnings INTERFACE)
target_compile_options(pfv_warnings INTERFACE -Wall -Wextra -Wpedantic -Wnon-virtual-dtor
                                              -Woverloaded-virtual)
if(PFV_WERROR)
  target_compile_options(pfv_warnings INTERFACE -Werror)
endif()

# Layers register their extensions from static initialisers: a linked layer must be loaded even
# when no symbol of it is referenced directly (some toolchains default to --as-needed).
add_link_options("LINKER:--no-as-needed")

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

# pfv_test(<name> SOURCES ... LIBS ...): a GoogleTest executable registered with ctest, run with
# the bundled resources and the built modules.
function(pfv_test name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBS" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE pfv_warnings GTest::gtest GTest::gmock GTest::gtest_main ${ARG_LIBS})
  add_test(NAME ${name} COMMAND ${name})
  set_tests_properties(${name} PROPERTIES ENVIRONMENT
    "VORStartupPath=${PFV_RESOURCE_DIR};VOR_MODULE_PATH=${PFV_MODULE_DIR};VOR_USER_SETTINGS_DIR=${CMAKE_BINARY_DIR}/test-settings/${name};PFV_TEST_DATA=${CMAKE_SOURCE_DIR}/tests/data;PFV_EXAMPLES=${CMAKE_SOURCE_DIR}/examples;QT_QPA_PLATFORM=offscreen;ASAN_OPTIONS=detect_leaks=1")
endfunction()
