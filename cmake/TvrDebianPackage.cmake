# The Debian package: everything of the install component "provider" in one
# package, tvr-physical-asset. Build it from a build directory with
#   cpack -G DEB
# Its dependencies come from dpkg-shlibdeps over the installed binaries, so
# they follow what the libraries really link (libpci3, libstdc++6, libc6, ...).
set(CPACK_PACKAGE_NAME "tvr-physical-asset")
set(CPACK_PACKAGE_VENDOR "TVR")
set(CPACK_PACKAGE_CONTACT "TVR platform team <platform@tvr.example>")
set(CPACK_PACKAGE_VERSION "${PROJECT_VERSION}")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY
    "CIM providers publishing the physical make-up of the machine")
set(CPACK_PACKAGE_DESCRIPTION
    "A CMPI 2.0 provider library for CIM object managers such as SFCB and\n"
    "OpenPegasus, with the agent libraries it reads the hardware through, the\n"
    "class and registration files, the registration scripts and the tvrpa tool.")
string(JOIN "" CPACK_PACKAGE_DESCRIPTION ${CPACK_PACKAGE_DESCRIPTION})
set(CPACK_GENERATOR "DEB")
set(CPACK_PACKAGING_INSTALL_PREFIX "/usr")

# One package of the one runtime component; headers and link-time names
# (component "development") stay out.
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_COMPONENTS_ALL provider)
set(CPACK_COMPONENTS_GROUPING ALL_COMPONENTS_IN_ONE)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION "admin")
set(CPACK_DEBIAN_PACKAGE_PRIORITY "optional")
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
# Debug information stays in the build tree; the exported entry points are in
# the dynamic symbol table, which stripping keeps.
set(CPACK_STRIP_FILES ON)

# The settings file is the administrator's: an upgrade must keep their edits.
set(_tvr_deb_control_dir "${PROJECT_BINARY_DIR}/deb-control")
file(MAKE_DIRECTORY "${_tvr_deb_control_dir}")
file(WRITE "${_tvr_deb_control_dir}/conffiles" "/etc/opt/tvr/platform.conf\n")
set(CPACK_DEBIAN_PACKAGE_CONTROL_EXTRA "${_tvr_deb_control_dir}/conffiles")

find_program(TVR_DPKG_SHLIBDEPS dpkg-shlibdeps)
if(TVR_DPKG_SHLIBDEPS)
  set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
  # The agent libraries are in the package itself, found through the run path.
  set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS "opt/tvr/platform/lib")
else()
  message(STATUS "dpkg-shlibdeps not found: the Debian package will declare no dependencies")
endif()

include(CPack)
