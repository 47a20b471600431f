# Installing and removing. `cmake --install BUILD` puts everything below the prefix, `cmake --build BUILD --target
# uninstall` takes exactly that away: the files, and the folders that were made for them.

include(GNUInstallDirs)

# orvela_install(FOLDER FILE [NAME]) or (FOLDER TARGET PROGRAM): installs it into a folder below the prefix. Folders
# that are not there yet are recorded, so that uninstalling knows which were made.
function(orvela_install folder file)
    install(CODE "set(folder \"${folder}\")\ninclude(\"${PROJECT_SOURCE_DIR}/cmake/RecordFolders.cmake\")")
    if(file STREQUAL TARGET)
        install(TARGETS ${ARGV2} RUNTIME DESTINATION ${folder})
    elseif(ARGC GREATER 2)
        install(FILES ${file} DESTINATION ${folder} RENAME ${ARGV2})
    else()
        install(FILES ${file} DESTINATION ${folder})
    endif()
endfunction()

install(CODE "set(record \"${PROJECT_BINARY_DIR}/install_folders.txt\")")

add_custom_target(uninstall COMMAND ${CMAKE_COMMAND} -P ${PROJECT_SOURCE_DIR}/cmake/Uninstall.cmake
                  WORKING_DIRECTORY ${PROJECT_BINARY_DIR} VERBATIM)
