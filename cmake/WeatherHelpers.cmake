# Helpers that keep every folder's CMakeLists.txt a short list.

set(WEATHER_WARNINGS -Wall -Wextra)

# Adds every direct subfolder of `dir` that has a CMakeLists.txt, so that
# each area of a component owns its own list of sources.
function(weather_add_area_subdirectories dir)
  file(GLOB children LIST_DIRECTORIES true ${CMAKE_CURRENT_SOURCE_DIR}/${dir}/*)
  list(SORT children)
  foreach(child ${children})
    if(IS_DIRECTORY ${child} AND EXISTS ${child}/CMakeLists.txt)
      add_subdirectory(${child})
    endif()
  endforeach()
endfunction()

function(weather_apply_flags target)
  target_compile_options(${target} PRIVATE ${WEATHER_WARNINGS})
  if(WEATHER_FUZZ)
    # Coverage for the fuzzer everywhere; the fuzzer's main is linked only
    # into the fuzz targets. Undefined behaviour stops the run like a crash.
    target_compile_options(${target} PRIVATE -fsanitize=fuzzer-no-link,address,undefined
                           -fno-sanitize-recover=undefined -fno-omit-frame-pointer)
    target_link_options(${target} PRIVATE -fsanitize=address,undefined)
  elseif(WEATHER_SANITIZE)
    target_compile_options(${target} PRIVATE -fsanitize=address,undefined -fno-omit-frame-pointer)
    target_link_options(${target} PRIVATE -fsanitize=address,undefined)
  endif()
endfunction()

# weather_add_library(name [SHARED|STATIC] SOURCES ... )
function(weather_add_library name)
  cmake_parse_arguments(ARG "SHARED;STATIC" "" "SOURCES" ${ARGN})
  set(kind STATIC)
  if(ARG_SHARED)
    set(kind SHARED)
  endif()
  add_library(${name} ${kind} ${ARG_SOURCES})
  set_target_properties(${name} PROPERTIES POSITION_INDEPENDENT_CODE ON)
  weather_apply_flags(${name})
endfunction()

function(weather_add_executable name)
  add_executable(${name} ${ARGN})
  weather_apply_flags(${name})
endfunction()

# weather_add_test(name SOURCES ... LIBS ...): one GoogleTest binary,
# each test registered with CTest on its own.
function(weather_add_test name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBS" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  weather_apply_flags(${name})
  target_link_libraries(${name} PRIVATE ${ARG_LIBS} weather-test-support GTest::gmock GTest::gtest_main)
  # The quiet-EFL variables and the build folder come from the test support
  # library (TestPlatform.cpp), not from CTest properties.
  gtest_discover_tests(${name} DISCOVERY_TIMEOUT 60)
endfunction()

# weather_add_folder_test(name LIBS ...): one test binary of every .cpp in
# the calling folder.
function(weather_add_folder_test name)
  cmake_parse_arguments(ARG "" "" "LIBS" ${ARGN})
  file(GLOB sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp)
  weather_add_test(${name} SOURCES ${sources} LIBS ${ARG_LIBS})
endfunction()
