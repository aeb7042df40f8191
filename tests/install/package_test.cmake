# The installed package as a host meets it, in a temporary prefix:
#  1. cmake --install into an empty prefix;
#  2. every installed public header compiled alone against it (headers/);
#  3. examples/host configured and built from it with the same toolchain, then run under
#     Wine with /selfcheck, which exits with 0 only when its dialog shows all its controls;
#  4. the cpack ZIP holds exactly the files of that install.
# Arguments: BUILD_DIR SOURCE_DIR WORK_DIR GENERATOR TOOLCHAIN [LAUNCHER]

function(run_step name)
  execute_process(COMMAND ${ARGN} RESULT_VARIABLE rc OUTPUT_VARIABLE out ERROR_VARIABLE out)
  if(NOT rc EQUAL 0)
    message(FATAL_ERROR "${name} failed (${rc}):\n${out}")
  endif()
  message(STATUS "${name}: ok")
  set(step_output "${out}" PARENT_SCOPE)
endfunction()

file(REMOVE_RECURSE ${WORK_DIR})
set(prefix ${WORK_DIR}/prefix)
run_step("install" ${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix ${prefix})

set(configure -G ${GENERATOR} -DCMAKE_TOOLCHAIN_FILE=${TOOLCHAIN} -DCMAKE_PREFIX_PATH=${prefix})
if(LAUNCHER)
  list(APPEND configure -DCMAKE_CXX_COMPILER_LAUNCHER=${LAUNCHER})
endif()
foreach(project headers:${SOURCE_DIR}/tests/install/headers host:${SOURCE_DIR}/examples/host)
  string(REGEX MATCH "^[a-z]+" name ${project})
  string(REGEX REPLACE "^[a-z]+:" "" source ${project})
  run_step("${name}: configure" ${CMAKE_COMMAND} -S ${source} -B ${WORK_DIR}/${name} ${configure})
  run_step("${name}: build" ${CMAKE_COMMAND} --build ${WORK_DIR}/${name})
endforeach()

set(ENV{ORVANE_WINEPREFIX} ${BUILD_DIR}/wineprefix)
run_step("host: /selfcheck" ${SOURCE_DIR}/tools/wine-run ${WORK_DIR}/host/OrvaneHost.exe /selfcheck)
message(STATUS "${step_output}")

run_step("cpack" ${CMAKE_CPACK_COMMAND} --config ${BUILD_DIR}/CPackConfig.cmake -B ${WORK_DIR}/zip)
file(GLOB zip ${WORK_DIR}/zip/*.zip)
file(ARCHIVE_EXTRACT INPUT ${zip} DESTINATION ${WORK_DIR}/unzipped)
file(GLOB top ${WORK_DIR}/unzipped/*)
file(GLOB_RECURSE zipped RELATIVE ${top} ${top}/*)
file(GLOB_RECURSE installed RELATIVE ${prefix} ${prefix}/*)
if(NOT zipped STREQUAL installed)
  message(FATAL_ERROR "the ZIP ${zip} holds\n  ${zipped}\nbut the install holds\n  ${installed}")
endif()
