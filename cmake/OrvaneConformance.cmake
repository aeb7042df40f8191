# Source compatibility with MFC as the library's users build it: every source of the
# library and of the gallery is compiled once more with the compiler's Microsoft
# extensions off and ISO C++ diagnostics as errors. MinGW's g++ turns
# -fms-extensions on by default, and with it accepts a message-map entry that names
# its handler without &Class:: (current MFC and MSVC's conforming mode refuse it).
#
# The compile runs as the CTest test "source_conformance", so that the test command
# checks it without doubling the work of every ordinary build. Sources are globbed
# by folder: whatever a family adds later is covered without a change here.

file(GLOB ORVANE_CONFORMANCE_LIBRARY_SOURCES CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/src/*/*.cpp)
file(GLOB ORVANE_CONFORMANCE_VALUES_SOURCES CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/src/values/*.cpp)
list(REMOVE_ITEM ORVANE_CONFORMANCE_LIBRARY_SOURCES ${ORVANE_CONFORMANCE_VALUES_SOURCES})
file(GLOB ORVANE_CONFORMANCE_GALLERY_SOURCES CONFIGURE_DEPENDS
  ${PROJECT_SOURCE_DIR}/demo/*.cpp ${PROJECT_SOURCE_DIR}/demo/pages/*.cpp)

set(ORVANE_CONFORMANCE_OPTIONS -fno-ms-extensions -pedantic-errors -O0 -g0)

function(orvane_conformance_objects name)
  cmake_parse_arguments(C "" "" "SOURCES;LIBS;DEFINITIONS;INCLUDES" ${ARGN})
  if(NOT C_SOURCES)
    return()
  endif()
  add_library(${name} OBJECT EXCLUDE_FROM_ALL ${C_SOURCES})
  target_compile_options(${name} PRIVATE ${ORVANE_CONFORMANCE_OPTIONS})
  target_compile_definitions(${name} PRIVATE ${C_DEFINITIONS})
  target_include_directories(${name} PRIVATE ${C_INCLUDES})
  # Only for their include folders and definitions: nothing is linked.
  target_link_libraries(${name} PRIVATE ${C_LIBS})
  list(APPEND ORVANE_CONFORMANCE_TARGETS ${name})
  set(ORVANE_CONFORMANCE_TARGETS ${ORVANE_CONFORMANCE_TARGETS} PARENT_SCOPE)
endfunction()

set(ORVANE_CONFORMANCE_TARGETS)
if(TARGET ValueTypesU)
  orvane_conformance_objects(orvane_conformance_values
    SOURCES ${ORVANE_CONFORMANCE_VALUES_SOURCES} LIBS ValueTypesU DEFINITIONS KVT_BUILDING_VALUETYPES)
endif()
if(TARGET OrvaneControlsU)
  orvane_conformance_objects(orvane_conformance_library
    SOURCES ${ORVANE_CONFORMANCE_LIBRARY_SOURCES} LIBS OrvaneControlsU DEFINITIONS _AFXEXT)
  orvane_conformance_objects(orvane_conformance_gallery
    SOURCES ${ORVANE_CONFORMANCE_GALLERY_SOURCES} LIBS OrvaneControlsU
    INCLUDES ${PROJECT_SOURCE_DIR}/demo ${PROJECT_SOURCE_DIR}/demo/res)
endif()

if(BUILD_TESTING AND ORVANE_CONFORMANCE_TARGETS)
  add_custom_target(orvane_conformance DEPENDS ${ORVANE_CONFORMANCE_TARGETS})
  add_test(NAME source_conformance
    COMMAND ${CMAKE_COMMAND} --build ${CMAKE_BINARY_DIR} --target orvane_conformance)
  set_tests_properties(source_conformance PROPERTIES RUN_SERIAL TRUE TIMEOUT 900)
endif()
