# tvr_add_gtest(<name> SOURCES <files...> [LIBS <targets...>] [LABELS <labels...>])
#
# Builds one GoogleTest/GoogleMock executable and registers it with CTest as a
# single test. One process per executable keeps the suite fast on small
# machines; tests inside an executable must not depend on each other.
find_package(GTest REQUIRED)

function(tvr_add_gtest name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBS;LABELS" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE ${ARG_LIBS} GTest::gmock GTest::gtest GTest::gmock_main)
  add_test(NAME ${name} COMMAND ${name} --gtest_brief=1)
  set_tests_properties(${name} PROPERTIES
    ENVIRONMENT "TVR_SOURCE_DIR=${PROJECT_SOURCE_DIR};TVR_BINARY_DIR=${PROJECT_BINARY_DIR}"
    TIMEOUT 600)
  if(ARG_LABELS)
    set_tests_properties(${name} PROPERTIES LABELS "${ARG_LABELS}")
  endif()
endfunction()
