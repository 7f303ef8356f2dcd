# Installs the SDK of the build folder BUILD, and moves it to SDK, so that what it says of its place there is seen to
# go along.
set(before ${SDK}-before)
file(REMOVE_RECURSE ${SDK} ${before})
execute_process(COMMAND ${CMAKE_COMMAND} --install ${BUILD} --component sdk --prefix ${before}
    COMMAND_ERROR_IS_FATAL ANY)
file(RENAME ${before} ${SDK})

file(GLOB package_files ${SDK}/lib/cmake/Kota0_ad/*.cmake)
if(NOT package_files)
    message(FATAL_ERROR "there is no config package")
endif()
foreach(file IN LISTS package_files)
    file(READ ${file} content)
    foreach(place IN ITEMS ${SOURCE} ${BUILD} ${before})
        string(FIND "${content}" ${place} found)
        if(NOT found EQUAL -1)
            message(FATAL_ERROR "${file} names ${place}")
        endif()
    endforeach()
endforeach()
