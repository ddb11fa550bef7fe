# SPDX-License-Identifier: MIT
# cmake -D BUILD=<build tree> -D SOURCE=<this project> -D QT=5|6 -D SYSTEM=ON|OFF -D DESCRIBED=ON|OFF -D SCRATCH=<dir> -P consume.cmake
# Installs the packages into a fresh prefix, builds the consumer against them, by CMake and by pkg-config, and runs it. With
# SYSTEM the core is built anew, against the installed platform only.
function(run)
    execute_process(COMMAND ${ARGV} COMMAND_ECHO STDOUT COMMAND_ERROR_IS_FATAL ANY)
endfunction()

file(REMOVE_RECURSE ${SCRATCH})
set(platform ${SCRATCH}/platform)
run(${CMAKE_COMMAND} --install ${BUILD} --prefix ${platform} --component HmiPlatform)
run(${CMAKE_COMMAND} --install ${BUILD} --prefix ${platform} --component HmiPlatformDev)
if(SYSTEM)
    set(core ${SCRATCH}/core)
    run(${CMAKE_COMMAND} -S ${SOURCE} -B ${SCRATCH}/build-core -G Ninja -D HMI_PLATFORM=system -D HMI_QT=${QT}
        -D CMAKE_PREFIX_PATH=${platform} -D CMAKE_BUILD_TYPE=Debug -D CMAKE_COMPILE_WARNING_AS_ERROR=ON)
    run(${CMAKE_COMMAND} --build ${SCRATCH}/build-core)
    if(DESCRIBED)
        run(${CMAKE_COMMAND} --build ${SCRATCH}/build-core --target qmltypes)
    endif()
    run(${CMAKE_COMMAND} --install ${SCRATCH}/build-core --prefix ${core})
else()
    set(core ${platform})
    run(${CMAKE_COMMAND} --install ${BUILD} --prefix ${core} --component HmiCore)
    run(${CMAKE_COMMAND} --install ${BUILD} --prefix ${core} --component HmiCoreDev)
endif()
foreach(module HmiCore HmiIntents HmiOverrides)
    if(DESCRIBED AND NOT EXISTS ${core}/${LIBDIR}/qml/${module}/plugins.qmltypes)
        message(FATAL_ERROR "The description of the QML module ${module} is not installed")
    endif()
endforeach()
set(ENV{LD_LIBRARY_PATH} ${core}/${LIBDIR}:${platform}/${LIBDIR})
set(ENV{PKG_CONFIG_PATH} ${core}/${LIBDIR}/pkgconfig:${platform}/${LIBDIR}/pkgconfig)
foreach(way IN ITEMS CMAKE PKG_CONFIG)
    set(build ${SCRATCH}/consumer-${way})
    run(${CMAKE_COMMAND} -S ${SOURCE}/tests/consumer -B ${build} -G Ninja -D FIND_BY=${way} -D QT=${QT}
        "-DCMAKE_PREFIX_PATH=${core}\;${platform}")
    run(${CMAKE_COMMAND} --build ${build})
    run(${build}/bin/consumer)
endforeach()

# A prefix may be moved: nothing in the packages names it.
file(GLOB_RECURSE described ${core}/${LIBDIR}/*.pc ${core}/${LIBDIR}/*.cmake ${platform}/${LIBDIR}/*.pc ${platform}/${LIBDIR}/*.cmake)
foreach(file IN LISTS described)
    file(STRINGS ${file} lines REGEX "${SCRATCH}|${SOURCE}")
    if(lines)
        message(FATAL_ERROR "${file} names a folder of this machine: ${lines}")
    endif()
endforeach()
