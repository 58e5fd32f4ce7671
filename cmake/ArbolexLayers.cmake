# The program's libraries and the layers they make. Each library is one or more
# folders of src/ and the libraries it uses; arbolex_library records both, and
# arbolex_check_layers reads every #include "folder/…" of a library's sources
# and stops the configuration when one reaches a folder of a library it does
# not use, directly or through the libraries it uses: an include against the
# layers (a cycle between libraries) or a dependency nobody declared.

# arbolex_library(NAME FOLDERS folder… [USES library…] [LINKS target…] [QT]
#                 [EXCLUDE regex])
function(arbolex_library name)
    cmake_parse_arguments(L "QT" "EXCLUDE" "FOLDERS;USES;LINKS" ${ARGN})
    set(sources)
    foreach(folder IN LISTS L_FOLDERS)
        file(GLOB found CONFIGURE_DEPENDS
            ${CMAKE_CURRENT_SOURCE_DIR}/${folder}/*.cpp ${CMAKE_CURRENT_SOURCE_DIR}/${folder}/*.hpp)
        list(APPEND sources ${found})
    endforeach()
    if(L_EXCLUDE)
        list(FILTER sources EXCLUDE REGEX "${L_EXCLUDE}")
    endif()
    add_library(${name} STATIC ${sources})
    target_include_directories(${name} PUBLIC ${CMAKE_CURRENT_SOURCE_DIR})
    target_link_libraries(${name} PUBLIC ${L_USES} ${L_LINKS})
    if(L_QT)
        target_link_libraries(${name} PRIVATE arbolex_qt_settings)
    endif()
    arbolex_settings(${name})
    set_property(GLOBAL APPEND PROPERTY ARBOLEX_LIBRARIES ${name})
    set_property(GLOBAL PROPERTY ARBOLEX_FOLDERS_${name} ${L_FOLDERS})
    set_property(GLOBAL PROPERTY ARBOLEX_USES_${name} ${L_USES})
    set_property(GLOBAL PROPERTY ARBOLEX_SOURCES_${name} ${sources})
endfunction()

# The folders `name` may include: its own and those of every library it uses,
# however far down.
function(arbolex_reachable_folders name out)
    set(folders)
    set(pending ${name})
    set(seen)
    while(pending)
        list(POP_FRONT pending library)
        if(library IN_LIST seen)
            continue()
        endif()
        list(APPEND seen ${library})
        get_property(own GLOBAL PROPERTY ARBOLEX_FOLDERS_${library})
        get_property(uses GLOBAL PROPERTY ARBOLEX_USES_${library})
        list(APPEND folders ${own})
        list(APPEND pending ${uses})
    endwhile()
    set(${out} ${folders} PARENT_SCOPE)
endfunction()

function(arbolex_check_layers)
    get_property(libraries GLOBAL PROPERTY ARBOLEX_LIBRARIES)
    set(projectFolders)
    foreach(library IN LISTS libraries)
        get_property(own GLOBAL PROPERTY ARBOLEX_FOLDERS_${library})
        list(APPEND projectFolders ${own})
    endforeach()
    foreach(library IN LISTS libraries)
        arbolex_reachable_folders(${library} allowed)
        get_property(sources GLOBAL PROPERTY ARBOLEX_SOURCES_${library})
        foreach(source IN LISTS sources)
            file(STRINGS ${source} includes REGEX "^#include \"[a-z]+/")
            foreach(line IN LISTS includes)
                string(REGEX REPLACE "^#include \"([a-z]+)/.*" "\\1" folder "${line}")
                if(folder IN_LIST projectFolders AND NOT folder IN_LIST allowed)
                    file(RELATIVE_PATH shown ${CMAKE_SOURCE_DIR} ${source})
                    message(FATAL_ERROR
                        "${shown} (library ${library}) includes ${folder}/, of a library "
                        "${library} does not use. A library includes only its own folders "
                        "and those of the libraries below it; an include the other way "
                        "round makes a cycle.")
                endif()
            endforeach()
        endforeach()
    endforeach()
endfunction()
