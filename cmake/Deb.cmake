# The Debian package of what is installed: cpack -G DEB in the build folder.
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME kest)
set(CPACK_PACKAGE_VERSION "${PROJECT_VERSION}")
set(CPACK_PACKAGE_CONTACT "Kest developers <kest@localhost>")
set(CPACK_PACKAGE_DIRECTORY "${CMAKE_BINARY_DIR}")
# All places are absolute: a device's own are, whatever the prefix.
set(CPACK_SET_DESTDIR ON)
set(CPACK_INSTALL_PREFIX "${CMAKE_INSTALL_PREFIX}")
set(CPACK_PRE_BUILD_SCRIPTS "${CMAKE_CURRENT_LIST_DIR}/DebFolders.cmake")

set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
# The packages share one program, and this compression finds that out.
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)
set(CPACK_DEBIAN_PACKAGE_MAINTAINER "${CPACK_PACKAGE_CONTACT}")
set(CPACK_DEBIAN_PACKAGE_SECTION utils)
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "tips for a wrist-worn device, and the device for a workstation")
set(CPACK_DEBIAN_PACKAGE_DESCRIPTION "Kest shows what a wrist-worn device can do: a list of tips, a page for each
that demonstrates it by itself, and a link that opens the application it is
about. Other applications can open the list or a tip.
.
The device runs on this workstation: in a window, or without a display.
kest-device starts it, drives it and shows what it holds: its applications,
settings, packages, log and screen.")

# What is linked is found by dpkg-shlibdeps; what is only opened or started at run time is not.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(runtime
  dbus-daemon               # a device's private bus where there is no session bus
  desktop-file-utils        # writes the desktop's table of who opens links
  libevas1-engines-x        # windows on X11
  libevas1-engines-wayland
  fontconfig                # the fonts' cache: without it every first start reads all of them
  fonts-noto-core           # Latin, Cyrillic, Arabic, Devanagari
  fonts-noto-cjk)           # Korean, Chinese
list(JOIN runtime ", " CPACK_DEBIAN_PACKAGE_DEPENDS)
# The bus that starts the application, and somebody who shows its notification.
set(CPACK_DEBIAN_PACKAGE_RECOMMENDS "default-dbus-session-bus | dbus-session-bus")
set(CPACK_DEBIAN_PACKAGE_SUGGESTS "notification-daemon, bash-completion")
include(CPack)
