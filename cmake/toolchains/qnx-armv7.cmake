# SPDX-License-Identifier: MIT
# ARMv7 with QNX Neutrino. What is the maker's comes in by the environment or by -D:
#
#   QNX_HOST, QNX_TARGET   as the SDK's qnxsdp-env.sh sets them
#   HMI_QNX_QT             the prefix of Qt 5.15 for this target
#   HMI_QNX_QT_TOOLS       the prefix of the same Qt's tools for the machine that builds (moc, rcc); HMI_QNX_QT if left out
#   HMI_QNX_COMPILER       the variant of qcc, such as 8.3.0,gcc_ntoarmv7le; the SDK's own choice of version if left out
#   HmiPlatform_DIR        where the maker's platform libraries have HmiPlatformConfig.cmake
#
# cmake -B build/qnx -D CMAKE_TOOLCHAIN_FILE=cmake/toolchains/qnx-armv7.cmake -D HMI_PLATFORM=system -D BUILD_TESTING=OFF \
#     -D HMI_QNX_QT=… -D HmiPlatform_DIR=…
set(CMAKE_SYSTEM_NAME QNX)
set(CMAKE_SYSTEM_PROCESSOR armv7le)

set(HMI_QNX_QT "$ENV{HMI_QNX_QT}" CACHE PATH "Prefix of Qt for QNX on ARMv7")
set(HMI_QNX_QT_TOOLS "$ENV{HMI_QNX_QT_TOOLS}" CACHE PATH "Prefix of the same Qt's tools for this machine")
set(HMI_QNX_COMPILER "gcc_ntoarmv7le" CACHE STRING "Variant of qcc")
list(APPEND CMAKE_TRY_COMPILE_PLATFORM_VARIABLES HMI_QNX_QT HMI_QNX_QT_TOOLS HMI_QNX_COMPILER)

foreach(variable QNX_HOST QNX_TARGET)
    if(NOT IS_DIRECTORY "$ENV{${variable}}")
        message(FATAL_ERROR "${variable} is not set, or names no folder: source the QNX SDK's qnxsdp-env.sh first")
    endif()
endforeach()
if(NOT EXISTS "${HMI_QNX_QT}/lib/cmake/Qt5Core")
    message(FATAL_ERROR "HMI_QNX_QT is '${HMI_QNX_QT}', where lib/cmake/Qt5Core is missing: it has to name the prefix of "
        "Qt 5.15 for QNX on ARMv7")
endif()

set(CMAKE_C_COMPILER $ENV{QNX_HOST}/usr/bin/qcc)
set(CMAKE_CXX_COMPILER $ENV{QNX_HOST}/usr/bin/q++)
set(CMAKE_C_COMPILER_TARGET ${HMI_QNX_COMPILER})
set(CMAKE_CXX_COMPILER_TARGET ${HMI_QNX_COMPILER})
foreach(compiler ${CMAKE_C_COMPILER} ${CMAKE_CXX_COMPILER})
    if(NOT EXISTS ${compiler})
        message(FATAL_ERROR "${compiler} is missing: QNX_HOST does not name the host part of the QNX SDK")
    endif()
endforeach()
set(CMAKE_CXX_FLAGS_INIT "-D_QNX_SOURCE")

set(CMAKE_SYSROOT $ENV{QNX_TARGET})
set(CMAKE_FIND_ROOT_PATH $ENV{QNX_TARGET} $ENV{QNX_TARGET}/armle-v7 ${HMI_QNX_QT})
set(CMAKE_PREFIX_PATH ${HMI_QNX_QT})
if(HMI_QNX_QT_TOOLS)
    set(QT_HOST_PATH ${HMI_QNX_QT_TOOLS})
    list(APPEND CMAKE_PROGRAM_PATH ${HMI_QNX_QT_TOOLS}/bin)
endif()
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_PACKAGE BOTH)
