# Deployment into CIM object managers: the class and registration files and
# the registration scripts installed beside the libraries, and the Debian
# package. Included from the top CMakeLists.txt after the folders that install
# something, and before the tests, which check the install.
#
# Installed layout (component "provider"; prefix /usr for the package):
#   /opt/tvr/platform/lib/               provider and agent libraries (their run path)
#   <prefix>/bin/tvrpa, <prefix>/share/man/man1/tvrpa.1
#   <prefix>/sbin/tvr-register-sfcb, tvr-register-pegasus
#   <prefix>/share/tvr-physical-asset/   TVRHX_PhysicalAsset.mof,
#       sfcb/tvrhx-physical-asset.reg, pegasus/TVRHX_PhysicalAssetRegistration.mof,
#       the same three of the companion providers (TVRHX_Companion.mof, ...),
#       systemd/tvr-platform.conf (an example drop-in)
#   /etc/opt/tvr/platform.conf           the agent libraries' settings
include(TvrPegasusRegistration)

set(TVR_SHARE_INSTALL_DIR "${CMAKE_INSTALL_DATADIR}/tvr-physical-asset")

install(FILES "${PROJECT_SOURCE_DIR}/schema/TVRHX_PhysicalAsset.mof"
  DESTINATION "${TVR_SHARE_INSTALL_DIR}" COMPONENT provider)
install(FILES "${PROJECT_SOURCE_DIR}/registration/sfcb/tvrhx-physical-asset.reg"
  DESTINATION "${TVR_SHARE_INSTALL_DIR}/sfcb" COMPONENT provider)
tvr_pegasus_registration(physical_asset_pegasus_registration
  REGISTRATION "${PROJECT_SOURCE_DIR}/registration/sfcb/tvrhx-physical-asset.reg"
  MODULE TVRPhysicalAssetProviderModule
  OUTPUT_NAME TVRHX_PhysicalAssetRegistration.mof
  DESTINATION "${TVR_SHARE_INSTALL_DIR}/pegasus"
  COMPONENT provider)

# The companion providers' classes and registration, for sites whose object
# manager has no providers of its own for TVRHX_ComputerSystem and
# TVRHX_NetworkPort (the registration scripts take --no-companion otherwise).
install(FILES "${PROJECT_SOURCE_DIR}/schema/TVRHX_Companion.mof"
  DESTINATION "${TVR_SHARE_INSTALL_DIR}" COMPONENT provider)
install(FILES "${PROJECT_SOURCE_DIR}/registration/sfcb/tvrhx-companion.reg"
  DESTINATION "${TVR_SHARE_INSTALL_DIR}/sfcb" COMPONENT provider)
tvr_pegasus_registration(companion_pegasus_registration
  REGISTRATION "${PROJECT_SOURCE_DIR}/registration/sfcb/tvrhx-companion.reg"
  MODULE TVRCompanionProviderModule
  OUTPUT_NAME TVRHX_CompanionRegistration.mof
  DESTINATION "${TVR_SHARE_INSTALL_DIR}/pegasus"
  COMPONENT provider)

install(FILES "${PROJECT_SOURCE_DIR}/deploy/systemd/tvr-platform.conf"
  DESTINATION "${TVR_SHARE_INSTALL_DIR}/systemd" COMPONENT provider)
install(PROGRAMS
    "${PROJECT_SOURCE_DIR}/deploy/sfcb/tvr-register-sfcb"
    "${PROJECT_SOURCE_DIR}/deploy/pegasus/tvr-register-pegasus"
  DESTINATION "${CMAKE_INSTALL_SBINDIR}" COMPONENT provider)

include(TvrDebianPackage)
