# Part of an installation: puts those of `folder` and what is around it that are still missing, the inner ones first,
# before what stands in the file `install_folders.txt` of the folder `records`.
cmake_path(ABSOLUTE_PATH folder BASE_DIRECTORY "${CMAKE_INSTALL_PREFIX}")
set(folder "${destdir}${folder}")
set(made "")
while(NOT EXISTS "${folder}")
    string(APPEND made "${folder}\n")
    cmake_path(GET folder PARENT_PATH folder)
endwhile()
set(known "")
if(EXISTS "${records}/install_folders.txt")
    file(READ "${records}/install_folders.txt" known)
endif()
file(WRITE "${records}/install_folders.txt" "${made}${known}")
