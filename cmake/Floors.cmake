# One floor of the house is one static library. A header of a floor is included as "floor/Header.h"; the
# path is reachable only for a target that names the floor in USES, so that an include which runs upwards,
# or past a floor that was not asked for, does not build.

add_library(lumora_options INTERFACE)
target_compile_options(lumora_options INTERFACE
  -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual
  -Wimplicit-fallthrough -Werror)
target_compile_definitions(lumora_options INTERFACE
  QT_NO_CAST_TO_ASCII QT_NO_FOREACH QT_NO_KEYWORDS LUMORA_VERSION="${PROJECT_VERSION}")
if(LUMORA_SANITIZE)
  # With the checks woven in, g++ no longer sees that a value is always set. clang knows no such warning.
  target_compile_options(lumora_options INTERFACE $<$<CXX_COMPILER_ID:GNU>:-Wno-maybe-uninitialized>)
  target_compile_options(lumora_options INTERFACE -fsanitize=${LUMORA_SANITIZE} -fno-omit-frame-pointer -fno-sanitize-recover=undefined)
  target_link_options(lumora_options INTERFACE -fsanitize=${LUMORA_SANITIZE})
endif()

# lumora_uses(TARGET floors and libraries...): links PRIVATE and makes the floors' headers reachable.
function(lumora_uses target)
  target_link_libraries(${target} PRIVATE lumora_options)
  foreach(used IN LISTS ARGN)
    get_filename_component(leaf ${used} NAME)
    if(TARGET floor_${leaf})
      target_link_libraries(${target} PRIVATE floor_${leaf})
    else()
      target_link_libraries(${target} PRIVATE ${used})
    endif()
  endforeach()
endfunction()

# lumora_floor(NAME USES floors and libraries...): the library floor_NAME from all sources of this folder and those below it but main.cpp, which a program
# beside the library adds to it, and but those of a floor within this one ("views/kit", the library floor_kit).
function(lumora_floor path)
  cmake_parse_arguments(FLOOR "" "" "USES" ${ARGN})
  get_filename_component(name ${path} NAME)
  file(GLOB_RECURSE sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.h ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp)
  list(FILTER sources EXCLUDE REGEX "/main\\.cpp$")
  file(GLOB within ${CMAKE_CURRENT_SOURCE_DIR}/*/CMakeLists.txt)
  foreach(floor IN LISTS within)
    get_filename_component(folder ${floor} DIRECTORY)
    list(FILTER sources EXCLUDE REGEX "^${folder}/")
  endforeach()
  add_library(floor_${name} STATIC ${sources})
  set(include_root ${CMAKE_BINARY_DIR}/include/${name})
  get_filename_component(above ${include_root}/${path} DIRECTORY)
  file(MAKE_DIRECTORY ${above})
  file(CREATE_LINK ${CMAKE_CURRENT_SOURCE_DIR} ${include_root}/${path} SYMBOLIC)
  target_include_directories(floor_${name} PUBLIC ${include_root})
  lumora_uses(floor_${name} ${FLOOR_USES})
  set_target_properties(floor_${name} PROPERTIES UNITY_BUILD ${LUMORA_UNITY} UNITY_BUILD_BATCH_SIZE 12)
  # The headers of the widgets are a third of what a view costs to compile; a handful of files does not pay for reading them once more.
  list(LENGTH sources count)
  if(LUMORA_PCH AND "Qt6::Widgets" IN_LIST FLOOR_USES AND count GREATER 20)
    target_precompile_headers(floor_${name} PRIVATE <QtWidgets/QtWidgets>)
  endif()
endfunction()

# lumora_test(NAME USES ... [LONG filter]): the test program test_NAME from all sources of this folder, run on Qt's offscreen platform. tests/Main.cpp is
# its main unless the folder has a Main.cpp of its own. Tests of the filter carry the label "long".
function(lumora_test name)
  cmake_parse_arguments(SUITE "" "LONG" "USES" ${ARGN})
  file(GLOB sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.h ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp)
  if(NOT EXISTS ${CMAKE_CURRENT_SOURCE_DIR}/Main.cpp)
    list(APPEND sources ${PROJECT_SOURCE_DIR}/tests/Main.cpp)
  endif()
  add_executable(test_${name} ${sources})
  # Half of a test's compile time goes into optimising what runs once; what it tests keeps the flags of the build. The preset "debug" steps through both.
  if(NOT CMAKE_BUILD_TYPE STREQUAL "Debug" OR LUMORA_SANITIZE)
    target_compile_options(test_${name} PRIVATE -O0 -g0)
  endif()
  lumora_uses(test_${name} ${SUITE_USES} Qt6::Gui GTest::gtest GTest::gmock)
  set(properties TIMEOUT 300 ENVIRONMENT QT_QPA_PLATFORM=offscreen) # pairs: a list as a value would shift those behind it
  set(discovery TEST_PREFIX "${name}." DISCOVERY_MODE PRE_TEST DISCOVERY_TIMEOUT 60)
  if(SUITE_LONG)
    gtest_discover_tests(test_${name} ${discovery} TEST_FILTER "${SUITE_LONG}" PROPERTIES ${properties} LABELS long)
    gtest_discover_tests(test_${name} ${discovery} TEST_FILTER "-${SUITE_LONG}" PROPERTIES ${properties})
  else()
    gtest_discover_tests(test_${name} ${discovery} PROPERTIES ${properties})
  endif()
endfunction()
