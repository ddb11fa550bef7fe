# SPDX-License-Identifier: MIT
# cmake -D BUILD=<build tree> -D SOURCE=<this project> -D QT=5|6 -D SYSTEM=ON|OFF -D DESCRIBED=ON|OFF -D SCRATCH=<dir> -P consume.cmake
# Installs the packages into a fresh prefix, builds the consumer against them and runs it. With SYSTEM the core is
# built anew, against the installed platform only.
function(run)
    execute_process(COMMAND ${ARGV} COMMAND_ECHO STDOUT COMMAND_ERROR_IS_FATAL ANY)
endfunction()

file(REMOVE_RECURSE ${SCRATCH})
set(platform ${SCRATCH}/platform)
run(${CMAKE_COMMAND} --install ${BUILD} --prefix ${platform} --component HmiPlatform)
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
endif()
foreach(module HmiCore HmiIntents HmiOverrides)
    if(DESCRIBED AND NOT EXISTS ${core}/${LIBDIR}/qml/${module}/plugins.qmltypes)
        message(FATAL_ERROR "The description of the QML module ${module} is not installed")
    endif()
endforeach()
run(${CMAKE_COMMAND} -S ${SOURCE}/tests/consumer -B ${SCRATCH}/consumer -G Ninja "-DCMAKE_PREFIX_PATH=${core}\;${platform}")
run(${CMAKE_COMMAND} --build ${SCRATCH}/consumer)
run(${CMAKE_COMMAND} -E env LD_LIBRARY_PATH=${core}/${LIBDIR}:${platform}/${LIBDIR} ${SCRATCH}/consumer/bin/consumer)
