# tvr_pegasus_registration(<target>
#     REGISTRATION <SFCB .reg file> MODULE <provider module name>
#     OUTPUT_NAME <file name> DESTINATION <install dir> COMPONENT <component>)
#
# Writes the OpenPegasus provider registration MOF of one provider library
# from its SFCB registration file at build time (so the two never disagree),
# as ${CMAKE_CURRENT_BINARY_DIR}/deploy/<file name>, and installs it. <target> is a
# target built by default that stands for the written file.
set(_tvr_pegasus_writer "${CMAKE_CURRENT_LIST_DIR}/../deploy/pegasus/WritePegasusRegistration.cmake")

function(tvr_pegasus_registration target)
  cmake_parse_arguments(ARG "" "REGISTRATION;MODULE;OUTPUT_NAME;DESTINATION;COMPONENT" "" ${ARGN})
  foreach(required REGISTRATION MODULE OUTPUT_NAME DESTINATION COMPONENT)
    if(NOT ARG_${required})
      message(FATAL_ERROR "tvr_pegasus_registration(${target}): ${required} is required")
    endif()
  endforeach()
  set(output "${CMAKE_CURRENT_BINARY_DIR}/deploy/${ARG_OUTPUT_NAME}")
  add_custom_command(OUTPUT "${output}"
    COMMAND "${CMAKE_COMMAND}"
            "-DREGISTRATION=${ARG_REGISTRATION}" "-DOUTPUT=${output}" "-DMODULE=${ARG_MODULE}"
            "-DVENDOR=TVR" "-DVERSION=${PROJECT_VERSION}"
            -P "${_tvr_pegasus_writer}"
    DEPENDS "${ARG_REGISTRATION}" "${_tvr_pegasus_writer}"
    COMMENT "Writing the OpenPegasus registration ${ARG_OUTPUT_NAME}"
    VERBATIM)
  add_custom_target(${target} ALL DEPENDS "${output}")
  set_target_properties(${target} PROPERTIES TVR_OUTPUT_FILE "${output}")
  install(FILES "${output}" DESTINATION "${ARG_DESTINATION}" COMPONENT "${ARG_COMPONENT}")
endfunction()
