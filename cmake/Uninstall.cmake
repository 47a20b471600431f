# Removes what the last installation from the build in the working folder put there.
if(NOT EXISTS install_manifest.txt OR NOT EXISTS install_destdir.txt)
    message(FATAL_ERROR "Nothing was installed from this build: there is no install_manifest.txt with an "
                        "install_destdir.txt. What an earlier version installed goes after installing once more.")
endif()

# take_line(TEXT LINE): moves the first line of the text. A list would not do: brackets and semicolons of a path count.
function(take_line text line)
    string(FIND "${${text}}" "\n" length)
    string(SUBSTRING "${${text}}" 0 ${length} first)
    math(EXPR next "${length} + 1")
    string(SUBSTRING "${${text}}" ${next} -1 rest)
    set(${line} "${first}" PARENT_SCOPE)
    set(${text} "${rest}" PARENT_SCOPE)
endfunction()

file(READ install_destdir.txt destdir)
file(READ install_manifest.txt files)
string(REGEX REPLACE "\n$" "" files "${files}")
string(APPEND files "\n") # which the last line lacks or not
while(NOT files STREQUAL "")
    take_line(files file)
    set(file "${destdir}${file}")
    message(STATUS "Removing: ${file}")
    file(REMOVE "${file}")
    if(EXISTS "${file}")
        message(FATAL_ERROR "${file} cannot be removed; ask for write access to its folder.")
    endif()
endwhile()

# Folders that were made for the installation, the inner ones first, unless somebody else uses them by now.
if(EXISTS install_folders.txt)
    file(READ install_folders.txt folders)
    while(NOT folders STREQUAL "")
        take_line(folders folder)
        execute_process(COMMAND rmdir -- "${folder}" ERROR_QUIET)
    endwhile()
endif()
file(REMOVE install_manifest.txt install_folders.txt install_destdir.txt)
