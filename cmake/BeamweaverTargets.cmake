# Target helpers every folder uses, so warnings, include paths, output locations and test
# registration are the same everywhere.
#
#   bw_library(<name> <sources...> [DEPS <targets...>])
#       Static library bw_<name>; DEPS are linked PUBLIC.
#   bw_test(<name> SOURCES <files...> [LIBS <targets...>] [THREADS])
#       GoogleTest executable test_<name>; its tests are named <name>.<Suite>.<Test>.
#       THREADS labels the tests "threads"; the thread-sanitizer build builds only those.
#   bw_program(<name> <sources...> [LIBS <targets...>])
#       Executable ${CMAKE_BINARY_DIR}/bin/<name>.
#   bw_benchmark(<name> <sources...> [LIBS <targets...>])
#       Google Benchmark executable ${CMAKE_BINARY_DIR}/bin/bench_<name> (with benchmark's main).
#   bw_fuzz_target(<name> <sources...> [LIBS <targets...>])
#       Sources define LLVMFuzzerTestOneInput. With BW_FUZZ: fuzzer ${CMAKE_BINARY_DIR}/bin/fuzz_<name>.
#       With tests: replay runner test_fuzz_<name> and test fuzz_replay_<name>, which feeds it
#       every file in fuzz/corpus/<name>.

set(BW_WARNING_FLAGS
    -Wall
    -Wextra
    -Wpedantic
    -Wshadow
    -Wnon-virtual-dtor
    -Wold-style-cast
    -Woverloaded-virtual
    -Wnull-dereference
    -Wdouble-promotion
    -Wformat=2)
if(BW_WERROR)
  list(APPEND BW_WARNING_FLAGS -Werror)
endif()

set(BW_FUZZ_REPLAY_MAIN ${CMAKE_CURRENT_LIST_DIR}/../fuzz/replay_main.cpp)

# The thread-sanitizer build exists to run the thread tests, so it compiles only what they need.
if(BW_SANITIZE STREQUAL "thread")
  set(BW_ONLY_WHEN_NEEDED EXCLUDE_FROM_ALL)
else()
  set(BW_ONLY_WHEN_NEEDED "")
endif()

function(bw_configure_target target)
  target_compile_options(${target} PRIVATE ${BW_WARNING_FLAGS})
  target_include_directories(${target} PUBLIC ${CMAKE_SOURCE_DIR}/src ${CMAKE_SOURCE_DIR}/include)
  set_target_properties(${target} PROPERTIES POSITION_INDEPENDENT_CODE ON)
endfunction()

function(bw_reject_unparsed_arguments function_name)
  if(ARGN)
    message(FATAL_ERROR "${function_name}: unexpected arguments: ${ARGN}")
  endif()
endfunction()

function(bw_library name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "DEPS")
  add_library(bw_${name} STATIC ${BW_ONLY_WHEN_NEEDED} ${arg_UNPARSED_ARGUMENTS})
  bw_configure_target(bw_${name})
  target_link_libraries(bw_${name} PUBLIC ${arg_DEPS})
endfunction()

function(bw_program name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "LIBS")
  add_executable(${name} ${BW_ONLY_WHEN_NEEDED} ${arg_UNPARSED_ARGUMENTS})
  bw_configure_target(${name})
  target_link_libraries(${name} PRIVATE ${arg_LIBS})
  set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
endfunction()

function(bw_benchmark name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "LIBS")
  if(NOT BW_BUILD_BENCH)
    return()
  endif()
  add_executable(bench_${name} ${BW_ONLY_WHEN_NEEDED} ${arg_UNPARSED_ARGUMENTS})
  bw_configure_target(bench_${name})
  target_link_libraries(bench_${name} PRIVATE ${arg_LIBS} benchmark::benchmark_main)
  set_target_properties(bench_${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
endfunction()

function(bw_test name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "THREADS" "" "SOURCES;LIBS")
  bw_reject_unparsed_arguments(bw_test ${arg_UNPARSED_ARGUMENTS})
  if(NOT BW_BUILD_TESTS)
    return()
  endif()
  if(BW_SANITIZE STREQUAL "thread" AND NOT arg_THREADS)
    return()
  endif()

  add_executable(test_${name} ${arg_SOURCES})
  bw_configure_target(test_${name})
  target_link_libraries(test_${name} PRIVATE ${arg_LIBS} GTest::gmock GTest::gtest_main Threads::Threads)
  target_compile_definitions(test_${name} PRIVATE "BW_SOURCE_DIR=\"${CMAKE_SOURCE_DIR}\"")
  # Helpers shared by several suites live in tests/common.
  target_include_directories(test_${name} PRIVATE ${CMAKE_SOURCE_DIR}/tests)

  set(properties "")
  if(arg_THREADS)
    set(properties LABELS threads)
  endif()
  gtest_discover_tests(test_${name}
                       TEST_PREFIX "${name}."
                       TEST_LIST bw_discovered_${name}
                       DISCOVERY_MODE PRE_TEST
                       DISCOVERY_TIMEOUT 120
                       PROPERTIES ${properties})
  bw_set_discovered_test_environment(bw_discovered_${name})
endfunction()

# Discovered tests exist only when ctest runs, and the discovery properties cannot carry a list
# such as the environment, so ctest includes a small script after discovery that sets it.
function(bw_set_discovered_test_environment test_list)
  if(NOT BW_TEST_ENVIRONMENT)
    return()
  endif()
  set(script ${CMAKE_CURRENT_BINARY_DIR}/${test_list}_environment.cmake)
  file(WRITE ${script}
       "if(${test_list})\n"
       "  set_tests_properties(\${${test_list}} PROPERTIES ENVIRONMENT [==[${BW_TEST_ENVIRONMENT}]==])\n"
       "endif()\n")
  set_property(DIRECTORY APPEND PROPERTY TEST_INCLUDE_FILES ${script})
endfunction()

function(bw_fuzz_target name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "LIBS")
  set(sources ${arg_UNPARSED_ARGUMENTS})

  if(BW_FUZZ)
    add_executable(fuzz_${name} ${sources})
    bw_configure_target(fuzz_${name})
    target_link_libraries(fuzz_${name} PRIVATE ${arg_LIBS})
    target_link_options(fuzz_${name} PRIVATE -fsanitize=fuzzer)
    set_target_properties(fuzz_${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
  endif()

  if(BW_BUILD_TESTS AND NOT BW_SANITIZE STREQUAL "thread")
    add_executable(test_fuzz_${name} ${sources} ${BW_FUZZ_REPLAY_MAIN})
    bw_configure_target(test_fuzz_${name})
    target_link_libraries(test_fuzz_${name} PRIVATE ${arg_LIBS})
    add_test(NAME fuzz_replay_${name} COMMAND test_fuzz_${name} ${CMAKE_SOURCE_DIR}/fuzz/corpus/${name})
    if(BW_TEST_ENVIRONMENT)
      set_tests_properties(fuzz_replay_${name} PROPERTIES ENVIRONMENT "${BW_TEST_ENVIRONMENT}")
    endif()
  endif()
endfunction()
