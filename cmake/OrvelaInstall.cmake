# Installing and removing. `cmake --install BUILD` puts everything below the prefix, `cmake --build BUILD --target
# uninstall` takes exactly that away: the files, and the folders that were made for them.

include(GNUInstallDirs)

# orvela_record_folders(FOLDER): records it and the folders around it, below the prefix, where they are not there yet,
# so that uninstalling knows which were made.
function(orvela_record_folders folder)
    install(CODE "set(folder \"${folder}\")\ninclude(\"${PROJECT_SOURCE_DIR}/cmake/RecordFolders.cmake\")")
endfunction()

# orvela_install(FOLDER FILE [NAME]) or (FOLDER TARGET PROGRAM): installs it into a folder below the prefix.
function(orvela_install folder file)
    orvela_record_folders(${folder})
    if(file STREQUAL TARGET)
        install(TARGETS ${ARGV2} RUNTIME DESTINATION ${folder} LIBRARY DESTINATION ${folder})
    elseif(ARGC GREATER 2)
        install(FILES ${file} DESTINATION ${folder} RENAME ${ARGV2})
    else()
        install(FILES ${file} DESTINATION ${folder})
    endif()
endfunction()

# Beside the manifest, whose paths lack DESTDIR, the build folder keeps the folders that were made, and DESTDIR: the
# latter when all is installed, as the manifest is.
install(CODE [[
    set(records "${CMAKE_CURRENT_LIST_DIR}")
    set(destdir "$ENV{DESTDIR}")
    if(NOT destdir STREQUAL "")
        cmake_path(ABSOLUTE_PATH destdir NORMALIZE)
    endif()
]])
cmake_language(DEFER DIRECTORY "${PROJECT_SOURCE_DIR}" CALL install CODE
               [[file(WRITE "${records}/install_destdir.txt" "${destdir}")]])

add_custom_target(uninstall COMMAND ${CMAKE_COMMAND} -P ${PROJECT_SOURCE_DIR}/cmake/Uninstall.cmake
                  WORKING_DIRECTORY ${PROJECT_BINARY_DIR} VERBATIM)
