# SPDX-License-Identifier: MIT
# Debian packages by CPack, one per component, of a build with the prefix /usr: ./hmi package. Names with a number follow the
# libraries' soname.

set(HMI_PACKAGE_MAINTAINER "HmiCore authors <authors@hmicore.invalid>" CACHE STRING "Maintainer of the Debian packages")
set(revision 1)
set(same_version "(= ${PROJECT_VERSION}-${revision})")
set(debian ${CMAKE_CURRENT_LIST_DIR}/debian)
if(NOT HMI_QT EQUAL 5 OR NOT HMI_PLATFORM STREQUAL "reference")
    message(FATAL_ERROR "HMI_PACKAGES needs HMI_QT=5 and HMI_PLATFORM=reference: the packages depend on those")
endif()

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME hmicore)
set(CPACK_PACKAGE_VENDOR "HmiCore")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "") # each has its own
set(CPACK_PACKAGE_CONTACT ${HMI_PACKAGE_MAINTAINER})
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES TRUE)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_COMPONENTS_GROUPING IGNORE)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SOURCE hmicore)
set(CPACK_DEBIAN_PACKAGE_RELEASE ${revision})
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION TRUE)
# The packages of one another's libraries stand in the table; those of all others are found.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS "")
foreach(library HmiLogging HmiStateMachine HmiGuiFramework AL2HMIBridge HmiCore)
    get_target_property(folder ${library} BINARY_DIR)
    list(APPEND CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${folder})
endforeach()

file(READ ${PROJECT_SOURCE_DIR}/LICENSE license)
string(REGEX REPLACE "^.*authors\n+" "" license "${license}")
string(REGEX REPLACE "\n+$" "" license "${license}")
string(REPLACE "\n" "\n " license " ${license}")
string(REGEX REPLACE "\n *\n" "\n .\n" license "${license}")
file(READ ${debian}/latin.txt latin)
file(MAKE_DIRECTORY ${CMAKE_BINARY_DIR}/debian)
execute_process(COMMAND gzip -9nc ${debian}/changelog OUTPUT_FILE ${CMAKE_BINARY_DIR}/debian/changelog.Debian.gz COMMAND_ERROR_IS_FATAL ANY)

# hmi_add_package(<component> NAME n SECTION s ARCHITECTURE all DEPENDS ... RECOMMENDS ... LIBRARIES ... DESCRIPTION "synopsis\ntext")
# LIBRARIES are shared libraries in it that others link.
function(hmi_add_package component)
    cmake_parse_arguments(ARG "" "NAME;SECTION;ARCHITECTURE;DESCRIPTION" "DEPENDS;RECOMMENDS;LIBRARIES" ${ARGN})
    string(TOUPPER ${component} upper)
    list(JOIN ARG_DEPENDS ", " depends)
    list(JOIN ARG_RECOMMENDS ", " recommends)
    set(values NAME "${ARG_NAME}" SECTION "${ARG_SECTION}" DEPENDS "${depends}" RECOMMENDS "${recommends}")
    if(ARG_ARCHITECTURE)
        list(APPEND values ARCHITECTURE ${ARG_ARCHITECTURE})
    else()
        list(APPEND values SHLIBDEPS ON)
    endif()
    while(values)
        list(POP_FRONT values name value)
        set(CPACK_DEBIAN_${upper}_PACKAGE_${name} "${value}" PARENT_SCOPE)
    endwhile()
    set(folder ${CMAKE_BINARY_DIR}/debian/${ARG_NAME})
    if(ARG_LIBRARIES)
        list(TRANSFORM ARG_LIBRARIES REPLACE "(.+)" "lib\\1 ${PROJECT_VERSION_MAJOR} ${ARG_NAME} ${same_version}\n" OUTPUT_VARIABLE lines)
        string(JOIN "" lines ${lines})
        file(WRITE ${folder}/shlibs "${lines}")
        file(WRITE ${folder}/triggers "activate-noawait ldconfig\n")
        set(CPACK_DEBIAN_${upper}_PACKAGE_CONTROL_EXTRA "${folder}/shlibs;${folder}/triggers" PARENT_SCOPE)
    endif()
    set(CPACK_DEBIAN_${upper}_DESCRIPTION "${ARG_DESCRIPTION}" PARENT_SCOPE)
    set(CPACK_COMPONENTS_ALL ${CPACK_COMPONENTS_ALL} ${component} PARENT_SCOPE)

    configure_file(${debian}/copyright.in ${folder}/copyright @ONLY)
    if(component STREQUAL "headunit")
        file(APPEND ${folder}/copyright "${latin}")
    endif()
    install(FILES ${folder}/copyright ${CMAKE_BINARY_DIR}/debian/changelog.Debian.gz
        DESTINATION share/doc/${ARG_NAME} COMPONENT ${component} EXCLUDE_FROM_ALL)
endfunction()

hmi_add_package(HmiPlatform NAME libhmiplatform${PROJECT_VERSION_MAJOR} SECTION libs
    LIBRARIES HmiLogging HmiStateMachine HmiGuiFramework AL2HMIBridge
    DESCRIPTION "open reference platform of HmiCore
Logging, hierarchical state machine, GUI framework and the bridge to a
vehicle's application layer: what the core of a head unit's HMI calls.")
hmi_add_package(HmiPlatformDev NAME libhmiplatform-dev SECTION libdevel
    DEPENDS "libhmiplatform${PROJECT_VERSION_MAJOR} ${same_version}" "qtbase5-dev (>= 5.15)" "qtdeclarative5-dev (>= 5.15)"
    DESCRIPTION "open reference platform of HmiCore (development files)
Headers, CMake package and pkg-config file of the reference platform's four
libraries.")
hmi_add_package(HmiCore NAME libhmicore${PROJECT_VERSION_MAJOR} SECTION libs LIBRARIES HmiCore
    DEPENDS "libhmiplatform${PROJECT_VERSION_MAJOR} ${same_version}" qml-module-qtqml qml-module-qtquick2
    DESCRIPTION "core library of a head unit's HMI
Takes over an executable's process, builds the QML engine, loads HMI modules
and input-method engines as plugins, and puts their states and views together
into one product.")
hmi_add_package(HmiCoreDev NAME libhmicore-dev SECTION libdevel
    DEPENDS "libhmicore${PROJECT_VERSION_MAJOR} ${same_version}" "libhmiplatform-dev ${same_version}"
            "qtbase5-dev (>= 5.15)" "qtdeclarative5-dev (>= 5.15)"
    RECOMMENDS "hmicore-doc ${same_version}"
    DESCRIPTION "core library of a head unit's HMI (development files)
Headers, CMake package, pkg-config file and descriptions of the QML types, for
modules, input engines and products of your own.")
hmi_add_package(docs NAME hmicore-doc SECTION doc ARCHITECTURE all
    DESCRIPTION "core library of a head unit's HMI (documentation)
Pages on how it works and how to build modules, input engines and products,
and the reference of all public classes.")
hmi_add_package(headunit NAME hmi-headunit SECTION misc
    DEPENDS "libhmicore${PROJECT_VERSION_MAJOR} ${same_version}" "libhmiplatform${PROJECT_VERSION_MAJOR} ${same_version}"
            qml-module-qtqml qml-module-qtquick2 qml-module-qtquick-window2 libqt5svg5
            fonts-inter fonts-noto-core fonts-noto-ui-core fonts-wqy-microhei
            tegaki-zinnia-simplified-chinese tegaki-zinnia-japanese libchewing3-data
    DESCRIPTION "reference head unit and simulated vehicle
A head unit with radio, media, phone, navigation, climate, messages, apps and
settings in seven languages, made of modules and input engines on HmiCore, with
vehicle-sim, the vehicle that it talks to, and its control panel.")

include(CPack)
