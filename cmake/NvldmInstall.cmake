# Where installed files go. What names no component belongs to the client.

set(CMAKE_INSTALL_DEFAULT_COMPONENT_NAME client)
set(CMAKE_INSTALL_DOCDIR "share/doc/norvell-device-manager" CACHE PATH "Folder of the client's documents")
include(GNUInstallDirs)
