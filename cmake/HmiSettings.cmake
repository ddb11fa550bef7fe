# SPDX-License-Identifier: MIT
# Tools, Qt version and compiler settings shared by every folder.

set(HMI_PLATFORM reference CACHE STRING "Platform libraries: 'reference' (this tree) or 'system' (find_package(HmiPlatform))")
set_property(CACHE HMI_PLATFORM PROPERTY STRINGS reference system)
if(NOT HMI_PLATFORM MATCHES "^(reference|system)$")
    message(FATAL_ERROR "HMI_PLATFORM is '${HMI_PLATFORM}'; it must be 'reference' or 'system'")
endif()
set(HMI_QT 5 CACHE STRING "Major version of Qt: 5 or 6")
set_property(CACHE HMI_QT PROPERTY STRINGS 5 6)
option(HMI_BENCHMARKS "Build the benchmarks" OFF)
option(HMI_FUZZ "Build the fuzzers; needs Clang" OFF)
option(HMI_PACKAGES "Let CPack make Debian packages" OFF)
option(HMI_QML_PRIVATE "Let the QML loggers use Qt's private object model (fast); otherwise the public API" ON)

find_package(ECM 5.100 REQUIRED NO_MODULE)
list(APPEND CMAKE_MODULE_PATH ${ECM_MODULE_PATH})
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)
include(GenerateExportHeader)
include(ECMEnableSanitizers)
include(ECMGenerateHeaders)
include(ECMAddTests)
include(FeatureSummary)
include(CTest)

find_package(QT NAMES Qt${HMI_QT} REQUIRED COMPONENTS Core)
find_package(Qt${QT_VERSION_MAJOR} 5.15 REQUIRED COMPONENTS Core Gui Qml Quick)

set(CMAKE_CXX_STANDARD 17)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_CXX_VISIBILITY_PRESET hidden)
set(CMAKE_VISIBILITY_INLINES_HIDDEN ON)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)
set(CMAKE_AUTOMOC ON)
set(CMAKE_INCLUDE_CURRENT_DIR OFF)
# From a library to its neighbours, from bin/ to them, and from the head unit's own folder below them.
set(CMAKE_INSTALL_RPATH "$ORIGIN;$ORIGIN/../${CMAKE_INSTALL_LIBDIR};$ORIGIN/../..")
set(CMAKE_EXPORT_COMPILE_COMMANDS ON)

find_program(CCACHE_PROGRAM ccache)
if(CCACHE_PROGRAM AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
    set(CMAKE_CXX_COMPILER_LAUNCHER ${CCACHE_PROGRAM})
endif()

add_compile_definitions(
    QT_NO_CAST_FROM_ASCII QT_NO_CAST_TO_ASCII QT_NO_CAST_FROM_BYTEARRAY QT_NO_URL_CAST_FROM_STRING
    QT_NO_KEYWORDS QT_NO_FOREACH QT_NO_NARROWING_CONVERSIONS_IN_CONNECT QT_STRICT_ITERATORS
    QT_MESSAGELOGCONTEXT)
add_compile_options(-Wall -Wextra -Wpedantic $<$<CXX_COMPILER_ID:GNU>:-Wshadow=local> -Wnon-virtual-dtor
    -Woverloaded-virtual -Wcast-qual -Wformat-security -Wundef)
if(CMAKE_CXX_COMPILER_ID STREQUAL "Clang")
    add_compile_options(-Wno-gnu-zero-variadic-macro-arguments) # Qt's logging macros, streamed into
endif()
if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU" AND CMAKE_CXX_COMPILER_VERSION VERSION_LESS 13)
    add_compile_options(-Wno-stringop-overflow) # taken in by QVector's moving of elements when it optimises
endif()
add_link_options(-Wl,--as-needed)
if(NOT ECM_ENABLE_SANITIZERS) # sanitized libraries find the runtime in the executable
    add_link_options(-Wl,--no-undefined)
endif()

set(HMI_TEST_ENVIRONMENT "")
if(ECM_ENABLE_SANITIZERS MATCHES "address")
    list(APPEND HMI_TEST_ENVIRONMENT
        "LSAN_OPTIONS=suppressions=${PROJECT_SOURCE_DIR}/tests/support/lsan.supp:print_suppressions=0")
endif()

# The annotations that let the sanitizer see through Qt stand before functions of Qt 5.
if(ECM_ENABLE_SANITIZERS MATCHES "thread" AND QT_VERSION_MAJOR EQUAL 5)
    set(HMI_WATCH_THREADS ON)
    list(APPEND HMI_TEST_ENVIRONMENT "TSAN_OPTIONS=suppressions=${PROJECT_SOURCE_DIR}/tests/support/tsan.supp")
endif()
