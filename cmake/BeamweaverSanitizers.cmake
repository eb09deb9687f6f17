# Global sanitizer instrumentation, chosen by BW_SANITIZE or BW_FUZZ.
#
# Sets BW_TEST_ENVIRONMENT: the environment every test runs with, so that sanitizer
# reports stop the test with a stack trace instead of scrolling past.

set(BW_TEST_ENVIRONMENT "")

if(BW_FUZZ AND NOT BW_SANITIZE STREQUAL "")
  message(FATAL_ERROR "BW_FUZZ already instruments with address and undefined; leave BW_SANITIZE empty")
endif()

if(BW_SANITIZE STREQUAL "address")
  set(bw_sanitize_flags -fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer)
  add_compile_options(${bw_sanitize_flags})
  add_link_options(${bw_sanitize_flags})
  set(BW_TEST_ENVIRONMENT
      "ASAN_OPTIONS=detect_leaks=1:abort_on_error=1"
      "UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1")
elseif(BW_SANITIZE STREQUAL "thread")
  set(bw_sanitize_flags -fsanitize=thread -fno-omit-frame-pointer)
  add_compile_options(${bw_sanitize_flags})
  add_link_options(${bw_sanitize_flags})
  set(BW_TEST_ENVIRONMENT "TSAN_OPTIONS=halt_on_error=1:second_deadlock_stack=1")
elseif(NOT BW_SANITIZE STREQUAL "")
  message(FATAL_ERROR "BW_SANITIZE must be empty, address or thread (got '${BW_SANITIZE}')")
endif()

if(BW_FUZZ)
  if(NOT CMAKE_CXX_COMPILER_ID MATCHES "Clang")
    message(FATAL_ERROR "BW_FUZZ needs clang (configure with CXX=clang++)")
  endif()
  # Everything gets coverage instrumentation; only the fuzz executables link the fuzzer driver.
  add_compile_options(-fsanitize=fuzzer-no-link,address,undefined -fno-sanitize-recover=all
                      -fno-omit-frame-pointer)
  add_link_options(-fsanitize=address,undefined)
  set(BW_TEST_ENVIRONMENT
      "ASAN_OPTIONS=detect_leaks=1:abort_on_error=1"
      "UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1")
endif()
