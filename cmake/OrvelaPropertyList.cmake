# orvela_property_list(TARGET): the module's property list as a resource of its file, made of the section that other
# systems have it in, without the bytes that fill up the section.
function(orvela_property_list target)
    set(source ${CMAKE_CURRENT_FUNCTION_LIST_DIR}/../src)
    set(list ${CMAKE_CURRENT_BINARY_DIR}/PropertyList/PropertyList.bin)
    add_library(${target}_property_list OBJECT ${source}/PluginEntry/PropertyListSection.cpp)
    target_include_directories(${target}_property_list PRIVATE ${source})
    target_link_libraries(${target}_property_list PRIVATE orvela_options)
    add_custom_command(OUTPUT ${list}
                       COMMAND ${CMAKE_OBJCOPY} -O binary --only-section=.pipl
                               $<TARGET_OBJECTS:${target}_property_list> ${list}.section
                       COMMAND head -c 374 ${list}.section > ${list}
                       DEPENDS ${target}_property_list $<TARGET_OBJECTS:${target}_property_list>)
    target_sources(${target} PRIVATE ${source}/PluginEntry/PropertyList.rc ${list})
    set_source_files_properties(${source}/PluginEntry/PropertyList.rc PROPERTIES
                                OBJECT_DEPENDS ${list} INCLUDE_DIRECTORIES ${CMAKE_CURRENT_BINARY_DIR}/PropertyList)
endfunction()
