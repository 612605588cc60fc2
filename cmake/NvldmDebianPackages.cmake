# `cpack` makes a package of the client and one of the emulator, and beside each one what was stripped off it.

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME norvell-device-manager)
set(CPACK_PACKAGE_VENDOR "Norvell Inc.")
set(CPACK_PACKAGE_CONTACT "Norvell Inc. <packages@norvell.example>")
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_DEBIAN_DEBUGINFO_PACKAGE ON)
set(CPACK_COMPONENTS_ALL client)
if(NVLDM_BUILD_EMULATOR)
    list(APPEND CPACK_COMPONENTS_ALL emulator)
endif()

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SOURCE norvell-device-manager)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)

set(CPACK_DEBIAN_CLIENT_PACKAGE_NAME norvell-device-manager)
set(CPACK_DEBIAN_CLIENT_PACKAGE_SECTION admin)
# Its pictures are drawn by a plugin, which no program is linked with.
set(CPACK_DEBIAN_CLIENT_PACKAGE_DEPENDS "libqt6svg6 (>= 6.4)")
# So are the display, the guide's browser and the toolkit's own texts, without which the program still runs.
set(CPACK_DEBIAN_CLIENT_PACKAGE_RECOMMENDS "qt6-wayland, xdg-utils, qt6-translations-l10n")
set(CPACK_DEBIAN_CLIENT_PACKAGE_SUGGESTS "norvell-device-manager-emulator, fonts-noto-cjk")
set(CPACK_DEBIAN_CLIENT_DESCRIPTION "desktop client for fleets of network cameras and recorders
Shows and runs the devices of a device manager service: one window, one
service at a time, up to 50000 devices. Devices stand in sites, and their
state, tasks and alarms are kept up to date.
.
Firmware, configurations, certificates and packages are uploaded to one
device or to thousands.")

set(CPACK_DEBIAN_EMULATOR_PACKAGE_NAME norvell-device-manager-emulator)
set(CPACK_DEBIAN_EMULATOR_PACKAGE_SECTION admin)
set(CPACK_DEBIAN_EMULATOR_PACKAGE_SUGGESTS "norvell-device-manager, bash-completion")
set(CPACK_DEBIAN_EMULATOR_DESCRIPTION "device manager service with a fleet that is made up
Plays the service of the Norvell Device Manager, with devices, sites, tasks
and alarms that live, and answers badly on demand. Made for trying out the
client, for training and for tests, where no devices are at hand.")

# The packages' files are as old as the sources, unless the environment says otherwise.
set(CPACK_PROJECT_CONFIG_FILE "${PROJECT_BINARY_DIR}/NvldmPackageDate.cmake")
file(CONFIGURE OUTPUT "${CPACK_PROJECT_CONFIG_FILE}" @ONLY CONTENT [[
if("$ENV{SOURCE_DATE_EPOCH}" STREQUAL "")
    set(ENV{SOURCE_DATE_EPOCH} @NVLDM_SOURCE_DATE_EPOCH@)
endif()
]])

# Everybody may enter the packages' folders, whatever mask the person has who makes them.
set(CPACK_PRE_BUILD_SCRIPTS "${PROJECT_BINARY_DIR}/NvldmPackageFolders.cmake")
file(CONFIGURE OUTPUT "${CPACK_PRE_BUILD_SCRIPTS}" @ONLY CONTENT [[
file(CHMOD_RECURSE "${CPACK_TEMPORARY_DIRECTORY}" DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
]])
include(CPack)
