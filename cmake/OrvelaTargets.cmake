# What every target of the project shares: the language level, the warnings, the exactness of floating-point
# arithmetic and the sanitizers of the chosen preset.

set(ORVELA_SANITIZE "" CACHE STRING "Sanitizers to build with, such as address,undefined or thread")
option(ORVELA_WERROR "Warnings of the compiler that the checks run with are errors")

add_library(orvela_options INTERFACE)
target_compile_features(orvela_options INTERFACE cxx_std_20)
# Contracted multiply-adds would round once where the filters' arithmetic is defined to round twice. Nobody reads errno
# or the floating-point exception flags; without them roots and comparisons vectorise, with the same results.
target_compile_options(orvela_options INTERFACE -Wall -Wextra -Wpedantic -ffp-contract=off -fno-math-errno
                                                -fno-trapping-math)
# Another compiler knows other warnings, and they must not keep anybody from building.
if(ORVELA_WERROR AND CMAKE_CXX_COMPILER_ID STREQUAL "GNU" AND CMAKE_CXX_COMPILER_VERSION MATCHES "^12\\.")
    target_compile_options(orvela_options INTERFACE -Werror)
endif()
if(ORVELA_SANITIZE)
    # With sanitizers the compiler finds members of std::regex that "may be used uninitialized". The release build
    # warns of such members.
    target_compile_options(orvela_options INTERFACE -fsanitize=${ORVELA_SANITIZE} -fno-omit-frame-pointer
                                                    -fno-sanitize-recover=all -Wno-maybe-uninitialized)
    target_link_options(orvela_options INTERFACE -fsanitize=${ORVELA_SANITIZE})
    target_compile_definitions(orvela_options INTERFACE QT_FORCE_ASSERTS _GLIBCXX_ASSERTIONS)
endif()
target_compile_definitions(orvela_options INTERFACE QT_NO_KEYWORDS)
# A symbol that another library of the process could take for its own would keep the module from being unloaded.
set(CMAKE_CXX_VISIBILITY_PRESET hidden)
set(CMAKE_VISIBILITY_INLINES_HIDDEN ON)

# orvela_automoc(TARGET): the target's sources go through moc. The build does not notice by itself that a file was
# added to them: without the time stamp it looks at all of them again.
function(orvela_automoc target)
    set_target_properties(${target} PROPERTIES AUTOMOC ON)
    file(REMOVE ${CMAKE_CURRENT_BINARY_DIR}/${target}_autogen/timestamp)
endfunction()

# orvela_library(NAME FOLDER...): a static library of every source below the given folders, those for another system
# left out.
function(orvela_library name)
    set(sources)
    foreach(folder IN LISTS ARGN)
        file(GLOB_RECURSE found CONFIGURE_DEPENDS ${folder}/*.cpp ${folder}/*.h)
        list(APPEND sources ${found})
    endforeach()
    if(WIN32)
        list(FILTER sources EXCLUDE REGEX "_Linux\\.cpp$")
    else()
        list(FILTER sources EXCLUDE REGEX "_Windows\\.cpp$")
    endif()
    add_library(${name} STATIC ${sources})
    set_target_properties(${name} PROPERTIES POSITION_INDEPENDENT_CODE ON)
    orvela_automoc(${name})
    target_link_libraries(${name} PUBLIC orvela_options)
endfunction()
