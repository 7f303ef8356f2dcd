# A level is a folder of the tree as a CMake target that sees its own headers and those of the levels it
# names, and nothing else. Headers are included by their path from the top of the tree, so each level gets
# an include directory of its own in which only its folder stands: a level that is not named cannot be
# included, whatever a source says.

add_custom_target(check_headers COMMENT "Every header compiles alone")

# The builds of the presets share those directories, so that what one has compiled the compiler cache can give
# to another.
cmake_path(GET CMAKE_BINARY_DIR PARENT_PATH KOTA_LEVELS)
if(NOT KOTA_LEVELS STREQUAL ${CMAKE_SOURCE_DIR}/build)
    set(KOTA_LEVELS ${CMAKE_BINARY_DIR})
endif()
string(APPEND KOTA_LEVELS /levels)

# kota_level(NAME FOLDER dir SOURCES file... HEADERS file... MAY_USE level...)
#
# NAME becomes an object library of the sources of FOLDER (paths relative to it). MAY_USE names the levels
# whose headers it may include, with all that those may include themselves.
function(kota_level NAME)
    cmake_parse_arguments(LEVEL "" "FOLDER" "SOURCES;HEADERS;MAY_USE" ${ARGN})
    set(source_dir ${CMAKE_SOURCE_DIR}/${LEVEL_FOLDER})
    set(view ${KOTA_LEVELS}/${NAME})
    list(TRANSFORM LEVEL_SOURCES PREPEND ${source_dir}/)

    foreach(header IN LISTS LEVEL_HEADERS)
        get_filename_component(folder ${view}/${LEVEL_FOLDER}/${header} DIRECTORY)
        file(MAKE_DIRECTORY ${folder})
        file(CREATE_LINK ${source_dir}/${header} ${view}/${LEVEL_FOLDER}/${header} SYMBOLIC)
    endforeach()

    add_library(${NAME} OBJECT ${LEVEL_SOURCES})
    target_include_directories(${NAME} PUBLIC $<BUILD_INTERFACE:${view}>)
    foreach(level IN LISTS LEVEL_MAY_USE)
        target_include_directories(${NAME} PUBLIC $<TARGET_PROPERTY:${level},INTERFACE_INCLUDE_DIRECTORIES>)
    endforeach()

    # One source per header that includes it and nothing else.
    set(alone)
    foreach(header IN LISTS LEVEL_HEADERS)
        string(MAKE_C_IDENTIFIER ${LEVEL_FOLDER}/${header} identifier)
        set(file ${CMAKE_BINARY_DIR}/headers/${identifier}.cpp)
        file(CONFIGURE OUTPUT ${file} CONTENT "#include \"${LEVEL_FOLDER}/${header}\"\n")
        list(APPEND alone ${file})
    endforeach()
    if(alone)
        add_library(${NAME}_headers OBJECT EXCLUDE_FROM_ALL ${alone})
        target_include_directories(${NAME}_headers PRIVATE $<TARGET_PROPERTY:${NAME},INCLUDE_DIRECTORIES>)
        target_compile_options(${NAME}_headers PRIVATE -O0 -g0)
        add_dependencies(check_headers ${NAME}_headers)
    endif()
endfunction()

# kota_language_library(NAME LEVEL level SOURCES file...)
#
# The texts of a library in one language, as a library of its own that KhLangLoadResDll finds: NAME is
# BASE_LANGUAGE. Its sources see what the level sees.
function(kota_language_library NAME)
    cmake_parse_arguments(LANGUAGE "" "LEVEL" "SOURCES" ${ARGN})
    add_library(${NAME} MODULE ${LANGUAGE_SOURCES})
    target_include_directories(${NAME} PRIVATE $<TARGET_PROPERTY:${LANGUAGE_LEVEL},INCLUDE_DIRECTORIES>)
endfunction()
