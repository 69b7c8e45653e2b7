# A folder is a target, and a target sees only the folders that it links: an include of a layer above does not build,
# because no include path leads there.

add_library(ka_options INTERFACE)
target_compile_definitions(ka_options INTERFACE
    QT_NO_KEYWORDS QT_NO_CAST_TO_ASCII QT_NO_FOREACH QT_NO_URL_CAST_FROM_STRING QT_STRICT_ITERATORS)
target_compile_options(ka_options INTERFACE
    -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wsign-conversion -Wold-style-cast -Wnon-virtual-dtor
    -Woverloaded-virtual -Wundef -Wcast-align)
# The libraries' own functions call each other directly, also where they are offered outside.
target_compile_options(ka_options INTERFACE -fno-semantic-interposition)
if(KAREPORT_WERROR)
    target_compile_options(ka_options INTERFACE -Werror)
endif()
if(KAREPORT_SANITIZE)
    target_compile_options(ka_options INTERFACE -fsanitize=${KAREPORT_SANITIZE} -fno-omit-frame-pointer
                                                -fno-sanitize-recover=all)
    target_link_options(ka_options INTERFACE -fsanitize=${KAREPORT_SANITIZE})
endif()
if(KAREPORT_COVERAGE)
    target_compile_options(ka_options INTERFACE --coverage -fprofile-update=atomic)
    target_link_options(ka_options INTERFACE --coverage)
endif()

# ka_layer(<target> LINKS <targets...> HEADERS <public...> PRIVATE_HEADERS <own...> SOURCES <...>)
# HEADERS are installed; PRIVATE_HEADERS serve the layers above inside this project only.
function(ka_layer target)
    cmake_parse_arguments(arg "" "" "LINKS;HEADERS;PRIVATE_HEADERS;SOURCES" ${ARGN})
    add_library(${target} STATIC ${arg_SOURCES})
    target_sources(${target} PUBLIC FILE_SET HEADERS BASE_DIRS ${CMAKE_CURRENT_SOURCE_DIR}
                   FILES ${arg_HEADERS} ${arg_PRIVATE_HEADERS})
    target_include_directories(${target} PUBLIC ${CMAKE_CURRENT_SOURCE_DIR})
    target_compile_definitions(${target} PRIVATE KAREPORT_BUILDING)
    target_link_libraries(${target} PUBLIC ${arg_LINKS} PRIVATE ka_options ka_hardening)
    list(TRANSFORM arg_HEADERS PREPEND ${CMAKE_CURRENT_SOURCE_DIR}/)
    set_property(TARGET ${target} PROPERTY KA_INSTALLED_HEADERS ${arg_HEADERS})
endfunction()
