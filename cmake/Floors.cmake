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
  # With its checks woven in, the compiler no longer sees that a value is always set.
  target_compile_options(lumora_options INTERFACE -Wno-maybe-uninitialized)
  target_compile_options(lumora_options INTERFACE -fsanitize=${LUMORA_SANITIZE} -fno-omit-frame-pointer -fno-sanitize-recover=undefined)
  target_link_options(lumora_options INTERFACE -fsanitize=${LUMORA_SANITIZE})
endif()

# lumora_uses(TARGET floors and libraries...): links PRIVATE and makes the floors' headers reachable.
function(lumora_uses target)
  target_link_libraries(${target} PRIVATE lumora_options)
  foreach(used IN LISTS ARGN)
    if(TARGET floor_${used})
      target_link_libraries(${target} PRIVATE floor_${used})
    else()
      target_link_libraries(${target} PRIVATE ${used})
    endif()
  endforeach()
endfunction()

# lumora_floor(NAME USES floors and libraries...): the library floor_NAME from all sources of this folder and those below it but main.cpp, which a program
# beside the library adds to it.
function(lumora_floor name)
  cmake_parse_arguments(FLOOR "" "" "USES" ${ARGN})
  file(GLOB_RECURSE sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.h ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp)
  list(FILTER sources EXCLUDE REGEX "/main\\.cpp$")
  add_library(floor_${name} STATIC ${sources})
  set(include_root ${CMAKE_BINARY_DIR}/include/${name})
  file(MAKE_DIRECTORY ${include_root})
  file(CREATE_LINK ${CMAKE_CURRENT_SOURCE_DIR} ${include_root}/${name} SYMBOLIC)
  target_include_directories(floor_${name} PUBLIC ${include_root})
  lumora_uses(floor_${name} ${FLOOR_USES})
endfunction()

# lumora_test(NAME USES ...): the test program test_NAME from all sources of this folder, run on Qt's offscreen platform. tests/Main.cpp is
# its main unless the folder has a Main.cpp of its own.
function(lumora_test name)
  cmake_parse_arguments(SUITE "" "" "USES" ${ARGN})
  file(GLOB sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.h ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp)
  if(NOT EXISTS ${CMAKE_CURRENT_SOURCE_DIR}/Main.cpp)
    list(APPEND sources ${PROJECT_SOURCE_DIR}/tests/Main.cpp)
  endif()
  add_executable(test_${name} ${sources})
  lumora_uses(test_${name} ${SUITE_USES} Qt6::Gui GTest::gtest GTest::gmock)
  gtest_discover_tests(test_${name} TEST_PREFIX "${name}." DISCOVERY_MODE PRE_TEST DISCOVERY_TIMEOUT 60
    PROPERTIES TIMEOUT 300 ENVIRONMENT "QT_QPA_PLATFORM=offscreen;QT_LOGGING_RULES=qt.qpa.*=false")
endfunction()
