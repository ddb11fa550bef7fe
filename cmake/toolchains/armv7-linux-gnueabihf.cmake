# SPDX-License-Identifier: MIT
# ARMv7 with hardware floating point, Linux: Debian's cross compiler, a sysroot made by tools/sysroot/armv7, and QEMU to run what was
# built. HMI_SYSROOT names the folder that was given to that script.
set(CMAKE_SYSTEM_NAME Linux)
set(CMAKE_SYSTEM_PROCESSOR armv7)
set(HMI_SYSROOT "${CMAKE_CURRENT_LIST_DIR}/../../build/sysroot-armv7" CACHE PATH "Made by tools/sysroot/armv7")
list(APPEND CMAKE_TRY_COMPILE_PLATFORM_VARIABLES HMI_SYSROOT)
get_filename_component(sysroot "${HMI_SYSROOT}/root" ABSOLUTE)
if(NOT EXISTS ${sysroot}/usr/include/arm-linux-gnueabihf/qt5)
    message(FATAL_ERROR "There is no sysroot in ${HMI_SYSROOT}; tools/sysroot/armv7 makes it")
endif()

set(triple arm-linux-gnueabihf)
set(CMAKE_C_COMPILER ${triple}-gcc)
set(CMAKE_CXX_COMPILER ${triple}-g++)
set(CMAKE_CXX_FLAGS_INIT "-march=armv7-a -mfpu=vfpv3-d16 -mfloat-abi=hard")
set(CMAKE_SYSROOT ${sysroot})
set(CMAKE_LIBRARY_ARCHITECTURE ${triple})
set(CMAKE_FIND_ROOT_PATH ${sysroot})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE BOTH) # extra-cmake-modules, which is the same everywhere, is the host's

# pkg-config has to look into the sysroot only.
set(ENV{PKG_CONFIG_DIR} "")
set(ENV{PKG_CONFIG_LIBDIR} "${sysroot}/usr/lib/${triple}/pkgconfig:${sysroot}/usr/share/pkgconfig")
set(ENV{PKG_CONFIG_SYSROOT_DIR} ${sysroot})

set(CMAKE_CROSSCOMPILING_EMULATOR qemu-arm-static -L ${sysroot} -E QML2_IMPORT_PATH=${sysroot}/usr/lib/${triple}/qt5/qml
    -E QT_PLUGIN_PATH=${sysroot}/usr/lib/${triple}/qt5/plugins)
