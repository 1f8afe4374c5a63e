# Where what is built looks for its files while it runs: in the build's own stage, or, with KEST_FOR_INSTALLATION, where
# they are installed. The paths are compiled in, so one build cannot serve for both.
include(GNUInstallDirs)
option(KEST_FOR_INSTALLATION "Build for the places that are installed to, instead of for the build's own stage" OFF)

if(KEST_FOR_INSTALLATION)
  if(KEST_TESTS OR KEST_BENCH)
    message(FATAL_ERROR "KEST_FOR_INSTALLATION: the tests and the benchmarks run from a build's own stage; "
                        "set KEST_TESTS and KEST_BENCH to OFF.")
  endif()
  # A device's own folder for packages, whatever the prefix: the packages are what a device has.
  set(DEVICE_PREINSTALLED_DIR "/opt/usr/apps")
  set(DEVICE_DATA_DIR "${CMAKE_INSTALL_FULL_DATADIR}/kest-device")
  set(DEVICE_NOTIFIER "${CMAKE_INSTALL_FULL_LIBEXECDIR}/kest-device/device-notifier")
endif()
