# Runs one scenario in a fresh copy of the host installation and compares what Osrik.exe writes
# with the expectations beside the scenario. Arguments: HOST, PLUGIN, PLATFORM (may be empty),
# SCENARIO, WORK (the folder to install into); EMULATOR (optional, its words separated by "|")
# runs a cross-built host, e.g. under Wine, which shows the Linux root as drive Z:. Such a host is
# given Windows paths, and reports them so.
get_filename_component(dir ${SCENARIO} DIRECTORY)
get_filename_component(name ${SCENARIO} NAME_WE)
get_filename_component(host_name ${HOST} NAME)
get_filename_component(plugin_name ${PLUGIN} NAME)

set(emulator "")
if(EMULATOR)
  string(REPLACE "|" ";" emulator "${EMULATOR}")
endif()
# The path as the host names it.
function(host_path path out)
  if(emulator)
    string(REPLACE "/" "\\" path "Z:${path}")
  endif()
  set(${out} "${path}" PARENT_SCOPE)
endfunction()
host_path("${WORK}" work_for_host)
host_path("${dir}" dir_for_host)
host_path("${SCENARIO}" scenario_for_host)

file(REMOVE_RECURSE ${WORK})
file(MAKE_DIRECTORY ${WORK}/Standard/Makros)
file(COPY ${HOST} ${PLUGIN} ${PLATFORM} DESTINATION ${WORK})
if(EXISTS ${dir}/${name}.ini)
  file(COPY_FILE ${dir}/${name}.ini ${WORK}/Standard/Makros/Kalmoret.ini)
endif()

file(STRINGS ${SCENARIO} option_lines REGEX "^# options:")
set(options)
foreach(line IN LISTS option_lines)
  string(REGEX REPLACE "^# options:[ ]*" "" line "${line}")
  separate_arguments(line UNIX_COMMAND "${line}")
  list(APPEND options ${line})
endforeach()

if(EXISTS ${dir}/${name}.svg)
  host_path("${WORK}/plan.svg" svg_for_host)
  list(APPEND options --svg ${svg_for_host})
endif()

host_path("${WORK}/project.json" out_for_host)
execute_process(
  COMMAND ${emulator} ${WORK}/${host_name} ${options} --out ${out_for_host} ${scenario_for_host}
  WORKING_DIRECTORY ${dir}
  RESULT_VARIABLE status
  ERROR_VARIABLE stderr)

# One folder's paths become the placeholder: as given, and as the host names it with its own
# separators (as written, escaped once in JSON, twice in a JSON text quoted in the trace).
function(replace_folder text folder folder_for_host placeholder out)
  string(REPLACE "${folder}/" "${placeholder}" text "${text}")
  set(prefix "${folder_for_host}\\")
  foreach(level 1 2 3)
    string(REPLACE "${prefix}" "${placeholder}" text "${text}")
    string(REPLACE "\\" "\\\\" prefix "${prefix}")
  endforeach()
  set(${out} "${text}" PARENT_SCOPE)
endfunction()

# Machine-independent text: the installation folder becomes "<host>/", the plug-in in it
# "<host>/<plug-in>".
function(normalise text out)
  replace_folder("${text}" "${WORK}" "${work_for_host}" "<host>/" text)
  replace_folder("${text}" "${dir}" "${dir_for_host}" "<scenarios>/" text)
  string(REPLACE "<host>/${plugin_name}" "<host>/<plug-in>" text "${text}")
  set(${out} "${text}" PARENT_SCOPE)
endfunction()

set(failures "")
if(EXISTS ${dir}/${name}.err)
  file(READ ${dir}/${name}.err expected_err)
  normalise("${stderr}" actual_err)
  string(STRIP "${expected_err}" expected_err)
  string(STRIP "${actual_err}" actual_err)
  if(status EQUAL 0)
    string(APPEND failures "Osrik.exe succeeded, but should have failed with: ${expected_err}\n")
  elseif(NOT actual_err STREQUAL expected_err)
    string(APPEND failures "failure reason\n  expected: ${expected_err}\n  actual:   ${actual_err}\n")
  endif()
elseif(NOT status EQUAL 0)
  string(APPEND failures "Osrik.exe failed (${status}): ${stderr}\n")
endif()

if(EXISTS ${dir}/${name}.json OR NOT EXISTS ${dir}/${name}.err)
  set(actual "")
  if(EXISTS ${WORK}/project.json)
    file(READ ${WORK}/project.json actual)
  endif()
  normalise("${actual}" actual)
  file(WRITE ${WORK}/${name}.actual.json "${actual}")
  if(NOT EXISTS ${dir}/${name}.json)
    string(APPEND failures "no ${name}.json yet; the project is in ${WORK}/${name}.actual.json\n")
  else()
    file(READ ${dir}/${name}.json expected)
    if(NOT actual STREQUAL expected)
      find_program(DIFF diff)
      if(DIFF)
        execute_process(COMMAND ${DIFF} -u ${dir}/${name}.json ${WORK}/${name}.actual.json
                        OUTPUT_VARIABLE difference)
      endif()
      string(APPEND failures "the project differs from ${name}.json:\n${difference}\n")
    endif()
  endif()
endif()

if(EXISTS ${dir}/${name}.svg)
  file(READ ${dir}/${name}.svg expected_svg)
  set(actual_svg "")
  if(EXISTS ${WORK}/plan.svg)
    file(READ ${WORK}/plan.svg actual_svg)
  endif()
  if(NOT actual_svg STREQUAL expected_svg)
    string(APPEND failures "the plan differs from ${name}.svg; see ${WORK}/plan.svg\n")
  endif()
endif()

if(failures)
  message(FATAL_ERROR "${failures}")
endif()
