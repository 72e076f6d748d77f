# Writes the OpenPegasus provider registration (PG_ProviderModule,
# PG_Provider and PG_ProviderCapabilities instances) from an SFCB provider
# registration file, so that both object managers are registered from the one
# file the embedded object manager and the tests read.
#
#   cmake -DREGISTRATION=<file.reg> -DOUTPUT=<file.mof> -DMODULE=<module name>
#         -DVENDOR=<vendor> -DVERSION=<x.y.z> -P WritePegasusRegistration.cmake
#
# Every section of the .reg file becomes one capability; every distinct
# `provider` one PG_Provider, in the order of first appearance. All sections
# must name the same `location`: one file describes one provider module.
# The providers are CMPI 2.0 providers, hence InterfaceType "CMPI" and
# InterfaceVersion "2.0.0".

cmake_minimum_required(VERSION 3.25)

foreach(required REGISTRATION OUTPUT MODULE VENDOR VERSION)
  if(NOT DEFINED ${required} OR "${${required}}" STREQUAL "")
    message(FATAL_ERROR "WritePegasusRegistration: -D${required}=... is required")
  endif()
endforeach()

file(STRINGS "${REGISTRATION}" lines)

set(classes "")
set(current "")
set(line_number 0)
foreach(line IN LISTS lines)
  math(EXPR line_number "${line_number} + 1")
  string(STRIP "${line}" line)
  if(line STREQUAL "" OR line MATCHES "^#")
    continue()
  endif()
  if(line MATCHES "^\\[([A-Za-z0-9_]+)\\]$")
    set(current "${CMAKE_MATCH_1}")
    list(APPEND classes "${current}")
    set(provider_${current} "")
    set(location_${current} "")
    set(type_${current} "")
    set(namespace_${current} "")
  elseif(line MATCHES "^([a-z]+):[ \t]*(.*)$")
    if(current STREQUAL "")
      message(FATAL_ERROR "${REGISTRATION}:${line_number}: entry outside a [class] section")
    endif()
    set(key "${CMAKE_MATCH_1}")
    set(value "${CMAKE_MATCH_2}")
    if(key MATCHES "^(provider|location|type|namespace)$")
      set(${key}_${current} "${value}")
    endif()
  else()
    message(FATAL_ERROR "${REGISTRATION}:${line_number}: cannot read '${line}'")
  endif()
endforeach()

if(classes STREQUAL "")
  message(FATAL_ERROR "${REGISTRATION}: no [class] section")
endif()

# The capability types of PG_ProviderCapabilities.ProviderType.
set(kind_code_instance 2)
set(kind_code_association 3)
set(kind_code_indication 4)
set(kind_code_method 5)

set(module_location "")
set(providers "")
set(capabilities "")
foreach(class IN LISTS classes)
  foreach(key provider location type namespace)
    if("${${key}_${class}}" STREQUAL "")
      message(FATAL_ERROR "${REGISTRATION}: [${class}] has no ${key}")
    endif()
  endforeach()
  if(module_location STREQUAL "")
    set(module_location "${location_${class}}")
  elseif(NOT module_location STREQUAL "${location_${class}}")
    message(FATAL_ERROR "${REGISTRATION}: [${class}] names location '${location_${class}}', "
                        "another section '${module_location}': one module per file")
  endif()
  if(NOT "${provider_${class}}" IN_LIST providers)
    list(APPEND providers "${provider_${class}}")
  endif()

  string(REGEX REPLACE "[ \t]+" ";" kinds "${type_${class}}")
  set(codes "")
  foreach(kind IN LISTS kinds)
    if(NOT DEFINED kind_code_${kind})
      message(FATAL_ERROR "${REGISTRATION}: [${class}] has the unknown type '${kind}'")
    endif()
    list(APPEND codes "${kind_code_${kind}}")
  endforeach()
  list(JOIN codes ", " codes)

  string(REGEX REPLACE "[ \t]+" ";" namespaces "${namespace_${class}}")
  list(TRANSFORM namespaces PREPEND "\"")
  list(TRANSFORM namespaces APPEND "\"")
  list(JOIN namespaces ", " namespaces)

  string(APPEND capabilities "
instance of PG_ProviderCapabilities
{
   ProviderModuleName = \"${MODULE}\";
   ProviderName = \"${provider_${class}}\";
   CapabilityID = \"${class}\";
   ClassName = \"${class}\";
   Namespaces = {${namespaces}};
   ProviderType = {${codes}};
   SupportedProperties = NULL;
   SupportedMethods = NULL;
};
")
endforeach()

get_filename_component(registration_name "${REGISTRATION}" NAME)
set(text "// OpenPegasus registration of the provider module ${MODULE}, written by the
// build from ${registration_name}; edit that file, not this one.
// Compile into the interop namespace: cimmof -n root/PG_InterOp <this file>

#pragma locale (\"en_US\")

instance of PG_ProviderModule
{
   Name = \"${MODULE}\";
   Vendor = \"${VENDOR}\";
   Version = \"${VERSION}\";
   InterfaceType = \"CMPI\";
   InterfaceVersion = \"2.0.0\";
   Location = \"${module_location}\";
};
")
foreach(provider IN LISTS providers)
  string(APPEND text "
instance of PG_Provider
{
   Name = \"${provider}\";
   ProviderModuleName = \"${MODULE}\";
};
")
endforeach()
string(APPEND text "${capabilities}")

file(WRITE "${OUTPUT}" "${text}")
