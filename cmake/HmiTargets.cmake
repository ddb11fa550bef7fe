# SPDX-License-Identifier: MIT
# The few functions with which every folder declares its targets.

set(HMI_BASE_DIR ${CMAKE_BINARY_DIR}/headunit/base) # what the installed head unit looks like
set(HMI_HEADUNIT_DIR ${CMAKE_INSTALL_LIBDIR}/headunit) # where it is installed: bin/, plugins/, settings/, …

# hmi_add_library(<name> SOURCES ... HEADERS ... [FORWARD Class A,B ...] [NAMESPACE ns] [PUBLIC ...] [PRIVATE ...]
#                 [INCLUDE_DIR dir] [COMPONENT c])
# A shared library with an export header, forwarding headers <name/Class>, soname 1 and install rules: what programs need to
# run in the component <export>, what they need to be built in <export>Dev.
# `A,B` makes forwarding headers A and B for a.h.
function(hmi_add_library name)
    cmake_parse_arguments(ARG "" "NAMESPACE;INCLUDE_DIR;EXPORT" "SOURCES;HEADERS;FORWARD;PUBLIC;PRIVATE" ${ARGN})
    add_library(${name} SHARED ${ARG_SOURCES} ${ARG_HEADERS})
    add_library(${ARG_NAMESPACE}::${name} ALIAS ${name})
    set(forwarding ${CMAKE_CURRENT_BINARY_DIR}/include/${name})
    string(TOLOWER ${name} lower)
    string(TOUPPER ${name} upper)
    generate_export_header(${name} BASE_NAME ${name} EXPORT_MACRO_NAME ${upper}_EXPORT
        EXPORT_FILE_NAME ${forwarding}/${lower}_export.h)
    ecm_generate_headers(forwarded HEADER_NAMES ${ARG_FORWARD} OUTPUT_DIR ${forwarding}
        RELATIVE ${ARG_INCLUDE_DIR}/${name} REQUIRED_HEADERS required)
    target_include_directories(${name}
        PUBLIC "$<BUILD_INTERFACE:${CMAKE_CURRENT_BINARY_DIR}/include>"
               "$<BUILD_INTERFACE:${CMAKE_CURRENT_SOURCE_DIR}/${ARG_INCLUDE_DIR}>"
               "$<BUILD_INTERFACE:${CMAKE_CURRENT_SOURCE_DIR}/${ARG_INCLUDE_DIR}/${name}>"
               "$<BUILD_INTERFACE:${forwarding}>" # lets a forwarded header find its neighbours, as when installed
               "$<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>")
    target_link_libraries(${name} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE})
    list(TRANSFORM ARG_HEADERS PREPEND ${CMAKE_CURRENT_SOURCE_DIR}/ REGEX "^[^/]" OUTPUT_VARIABLE all_headers)
    set_target_properties(${name} PROPERTIES VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR}
        HMI_HEADERS "${all_headers}")
    install(TARGETS ${name} EXPORT ${ARG_EXPORT}
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT ${ARG_EXPORT} NAMELINK_COMPONENT ${ARG_EXPORT}Dev)
    install(FILES ${forwarded} ${ARG_HEADERS} ${forwarding}/${lower}_export.h
        DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/${name} COMPONENT ${ARG_EXPORT}Dev)
endfunction()

# hmi_install_package(<name> NAMESPACE ns LIBRARIES ... REQUIRES ...): installs the export set <name>, a package config made from
# <name>Config.cmake.in, and <name>.pc for pkg-config, with the libraries and the modules that it requires.
function(hmi_install_package name)
    cmake_parse_arguments(ARG "" "NAMESPACE" "LIBRARIES;REQUIRES" ${ARGN})
    set(destination ${CMAKE_INSTALL_LIBDIR}/cmake/${name})
    install(EXPORT ${name} FILE ${name}Targets.cmake NAMESPACE ${ARG_NAMESPACE}:: DESTINATION ${destination} COMPONENT ${name}Dev)
    configure_package_config_file(${name}Config.cmake.in ${CMAKE_CURRENT_BINARY_DIR}/${name}Config.cmake
        INSTALL_DESTINATION ${destination})
    write_basic_package_version_file(${CMAKE_CURRENT_BINARY_DIR}/${name}ConfigVersion.cmake COMPATIBILITY SameMajorVersion)
    install(FILES ${CMAKE_CURRENT_BINARY_DIR}/${name}Config.cmake ${CMAKE_CURRENT_BINARY_DIR}/${name}ConfigVersion.cmake
        DESTINATION ${destination} COMPONENT ${name}Dev)

    set(destination ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
    file(RELATIVE_PATH to_prefix /${destination} /)
    list(TRANSFORM ARG_LIBRARIES PREPEND -l)
    list(JOIN ARG_LIBRARIES " " libraries)
    list(JOIN ARG_REQUIRES ", " requires)
    configure_file(${PROJECT_SOURCE_DIR}/cmake/HmiPackage.pc.in ${CMAKE_CURRENT_BINARY_DIR}/${name}.pc @ONLY)
    install(FILES ${CMAKE_CURRENT_BINARY_DIR}/${name}.pc DESTINATION ${destination} COMPONENT ${name}Dev)
endfunction()

# hmi_add_resources(<target> PREFIX /p FILES ...): compiles files into the target; on Qt 5 the QML ahead of time, for
# which Qt 5 allows one call per folder.
function(hmi_add_resources target)
    cmake_parse_arguments(ARG "" "PREFIX" "FILES" ${ARGN})
    set(entries "")
    foreach(file IN LISTS ARG_FILES)
        string(APPEND entries "    <file alias=\"${file}\">${CMAKE_CURRENT_SOURCE_DIR}/${file}</file>\n")
    endforeach()
    string(MAKE_C_IDENTIFIER "${target}${ARG_PREFIX}" stem)
    set(qrc ${CMAKE_CURRENT_BINARY_DIR}/${stem}.qrc)
    file(CONFIGURE OUTPUT ${qrc} CONTENT "<RCC>\n  <qresource prefix=\"${ARG_PREFIX}\">\n${entries}  </qresource>\n</RCC>\n" @ONLY)
    if(QT_VERSION_MAJOR EQUAL 5 AND entries MATCHES "[.]qml<")
        find_package(Qt5QuickCompiler REQUIRED)
        qtquick_compiler_add_resources(generated ${qrc})
    elseif(QT_VERSION_MAJOR EQUAL 5)
        qt5_add_resources(generated ${qrc})
    else()
        qt_add_resources(generated ${qrc})
    endif()
    target_sources(${target} PRIVATE ${generated})
endfunction()

# hmi_add_test(<tst_name> [SOURCES ...] [LINK ...] [WRAPPER program]): one QtTest executable, run headless with a deadline,
# by another program if it needs that.
function(hmi_add_test name)
    cmake_parse_arguments(ARG "" "TIMEOUT;WRAPPER" "SOURCES;LINK;ENVIRONMENT" ${ARGN})
    if(NOT ARG_SOURCES)
        set(ARG_SOURCES ${name}.cpp)
    endif()
    if(NOT ARG_TIMEOUT)
        set(ARG_TIMEOUT 120)
    endif()
    if(CMAKE_CROSSCOMPILING_EMULATOR)
        math(EXPR ARG_TIMEOUT "10 * ${ARG_TIMEOUT}")
    elseif(ECM_ENABLE_SANITIZERS)
        math(EXPR ARG_TIMEOUT "3 * ${ARG_TIMEOUT}")
    endif()
    add_executable(${name} ${ARG_SOURCES})
    target_link_libraries(${name} PRIVATE HmiTestSupport Qt${QT_VERSION_MAJOR}::Test ${ARG_LINK})
    hmi_watch_threads(${name})
    add_test(NAME ${name} COMMAND ${ARG_WRAPPER} ${CMAKE_CROSSCOMPILING_EMULATOR} $<TARGET_FILE:${name}>)
    math(EXPR milliseconds "1000 * ${ARG_TIMEOUT}")
    # The longest are started first, so that no single one is waited for at the end.
    set_tests_properties(${name} PROPERTIES TIMEOUT ${ARG_TIMEOUT} COST ${ARG_TIMEOUT}
        ENVIRONMENT "QT_QPA_PLATFORM=offscreen;QT_QUICK_BACKEND=software;LC_ALL=C.UTF-8;QTEST_FUNCTION_TIMEOUT=${milliseconds};${HMI_TEST_ENVIRONMENT};${ARG_ENVIRONMENT}")
endfunction()

# hmi_watch_threads(<executable>): lets the thread sanitizer, if there is one, see what Qt orders between threads. Every
# program that tests run needs it.
function(hmi_watch_threads name)
    if(HMI_WATCH_THREADS)
        target_link_libraries(${name} PRIVATE HmiThreadAnnotations)
    endif()
endfunction()

# hmi_add_module(<name> SOURCES ... QML ... FILES ...): an HMI module plugin of the reference head unit.
# QML files and FILES (view descriptors) are found under ":/<name>", files of icons/ under ":/icons".
function(hmi_add_module name)
    cmake_parse_arguments(ARG "" "" "SOURCES;QML;FILES" ${ARGN})
    set(target hmi_module_${name})
    file(GLOB icons RELATIVE ${CMAKE_CURRENT_SOURCE_DIR} CONFIGURE_DEPENDS icons/*.svg)
    add_library(${target} MODULE ${ARG_SOURCES})
    target_link_libraries(${target} PRIVATE HmiCore::HmiCore)
    hmi_add_resources(${target} PREFIX /${name} FILES ${ARG_QML} ${ARG_FILES})
    if(icons)
        hmi_add_resources(${target} PREFIX / FILES ${icons})
    endif()
    set_target_properties(${target} PROPERTIES LIBRARY_OUTPUT_DIRECTORY ${HMI_BASE_DIR}/plugins)
    install(TARGETS ${target} LIBRARY DESTINATION ${HMI_HEADUNIT_DIR}/plugins COMPONENT headunit)
    hmi_add_translations(${name})
endfunction()

# The languages of the reference head unit, and the locales that each serves.
set(HMI_LANGUAGES en de fr es ar zh_CN zh_TW)
set(HMI_LOCALES_en en_US en_GB)
set(HMI_LOCALES_de de_DE)
set(HMI_LOCALES_fr fr_FR fr_CA)
set(HMI_LOCALES_es es_ES es_MX)
set(HMI_LOCALES_ar ar_SA)
set(HMI_LOCALES_zh_CN zh_CN)
set(HMI_LOCALES_zh_TW zh_TW)

# hmi_add_translations(<name> [PRODUCT] [FOLDERS ...]): compiles translations/<name>_<language>.ts. A module's are found by
# language (translations/<name>_de.qm), those of the product by locale (translations/app/<name>_de_DE.qm). The target
# `update_translations` brings all .ts files in step with the texts in FOLDERS, by default in this one.
function(hmi_add_translations name)
    cmake_parse_arguments(ARG "PRODUCT" "" "FOLDERS" ${ARGN})
    if(NOT ARG_FOLDERS)
        set(ARG_FOLDERS ${CMAKE_CURRENT_SOURCE_DIR})
    endif()
    set(sources "")
    set(catalogues "")
    foreach(language IN LISTS HMI_LANGUAGES)
        set(source ${CMAKE_CURRENT_SOURCE_DIR}/translations/${name}_${language}.ts)
        list(APPEND sources ${source})
        if(ARG_PRODUCT)
            list(TRANSFORM HMI_LOCALES_${language} PREPEND app/${name}_ OUTPUT_VARIABLE files)
        else()
            set(files ${name}_${language})
        endif()
        foreach(file IN LISTS files)
            set(catalogue ${HMI_BASE_DIR}/translations/${file}.qm)
            get_filename_component(folder ${catalogue} DIRECTORY)
            file(MAKE_DIRECTORY ${folder})
            add_custom_command(OUTPUT ${catalogue} DEPENDS ${source}
                COMMAND Qt${QT_VERSION_MAJOR}::lrelease -silent ${source} -qm ${catalogue})
            list(APPEND catalogues ${catalogue})
        endforeach()
    endforeach()
    add_custom_target(translations_${name} ALL DEPENDS ${catalogues})
    foreach(catalogue IN LISTS catalogues)
        file(RELATIVE_PATH relative ${HMI_BASE_DIR} ${catalogue})
        get_filename_component(folder ${relative} DIRECTORY)
        install(FILES ${catalogue} DESTINATION ${HMI_HEADUNIT_DIR}/${folder} COMPONENT headunit)
    endforeach()

    set(kind MODULE)
    if(ARG_PRODUCT)
        set(kind PRODUCT)
    endif()
    string(REPLACE ";" "|" folders "${ARG_FOLDERS}")
    set_property(GLOBAL APPEND PROPERTY HMI_CATALOGUES "${name}|${CMAKE_CURRENT_SOURCE_DIR}/translations|${kind}|${folders}")

    if(NOT TARGET update_translations)
        add_custom_target(update_translations)
    endif()
    add_custom_target(update_translations_${name}
        COMMAND Qt${QT_VERSION_MAJOR}::lupdate -silent -locations none -no-obsolete ${ARG_FOLDERS} -ts ${sources})
    add_dependencies(update_translations update_translations_${name})
endfunction()
