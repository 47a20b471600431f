# Part of an installation: appends to the file `record` those of `folder` and what is around it that are still missing.
cmake_path(ABSOLUTE_PATH folder BASE_DIRECTORY "${CMAKE_INSTALL_PREFIX}")
set(folder "$ENV{DESTDIR}${folder}")
while(NOT EXISTS "${folder}")
    file(APPEND "${record}" "${folder}\n")
    cmake_path(GET folder PARENT_PATH folder)
endwhile()
