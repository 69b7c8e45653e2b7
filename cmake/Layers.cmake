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

# Much of a build goes into reading the same headers again: they are compiled once for what sees Qt's core alone, and once
# for what sees its windows as well. What is built for users is built without, so that every file names what it needs.
set(KA_CORE_HEADERS
    <QByteArray> <QDir> <QFile> <QFileInfo> <QHash> <QString> <QStringList> <QVariant> <algorithm> <functional> <memory>
    <optional> <string> <utility> <variant> <vector>)
set(KA_WIDGET_HEADERS ${KA_CORE_HEADERS} <QApplication> <QFont> <QPainter> <QWidget>)

# ka_precompile(<target> <whether it sees Qt's windows>)
function(ka_precompile target widgets)
    set(owner ka_values_objects)
    if(widgets)
        set(owner ka_frame_objects)
    endif()
    target_compile_options(${target} PRIVATE $<$<CXX_COMPILER_ID:GNU>:-fpch-preprocess>) # for ccache
    if(NOT target STREQUAL owner)
        target_precompile_headers(${target} REUSE_FROM ${owner})
    elseif(owner STREQUAL ka_values_objects)
        target_precompile_headers(${target} PRIVATE ${KA_CORE_HEADERS})
    else()
        target_precompile_headers(${target} PRIVATE ${KA_WIDGET_HEADERS})
    endif()
endfunction()

# ka_layer(<target> LINKS <targets...> USES <libraries...> HEADERS <public...> PRIVATE_HEADERS <own...> SOURCES <...>
#          [WIDGETS])
#
# A folder of the module or of the host. LINKS are the layers below and what the headers need of other libraries; USES is
# what the sources alone need. HEADERS are installed; PRIVATE_HEADERS serve the layers above inside this project only.
# WIDGETS says that the sources see Qt's windows.
#
# Three targets are made, as the same code is linked in two ways:
#   <target>_api      the headers of this layer and of those below it; nothing is linked by it
#   <target>_objects  the compiled sources, which the shared library is made of
#   <target>          the layer and those below it as static libraries, for what must see more than the shared libraries
#                     offer: tests and benchmarks
function(ka_layer target)
    cmake_parse_arguments(arg "WIDGETS" "" "LINKS;USES;HEADERS;PRIVATE_HEADERS;SOURCES" ${ARGN})
    ka_apis(apis ${arg_LINKS})
    add_library(${target}_api INTERFACE)
    target_include_directories(${target}_api INTERFACE ${CMAKE_CURRENT_SOURCE_DIR})
    target_link_libraries(${target}_api INTERFACE ${apis})

    add_library(${target}_objects OBJECT ${arg_SOURCES})
    # Not of the target: the compiled headers serve what is outside the libraries as well.
    set_source_files_properties(${arg_SOURCES} PROPERTIES COMPILE_DEFINITIONS KAREPORT_BUILDING)
    target_link_libraries(${target}_objects PUBLIC ${target}_api ${arg_USES} PRIVATE ka_options ka_hardening)

    ka_precompile(${target}_objects "${arg_WIDGETS}")

    add_library(${target} STATIC)
    target_link_libraries(${target} PUBLIC ${target}_objects ${target}_api ${arg_LINKS} ${arg_USES})
    target_sources(${target} PUBLIC FILE_SET HEADERS BASE_DIRS ${CMAKE_CURRENT_SOURCE_DIR}
                   FILES ${arg_HEADERS} ${arg_PRIVATE_HEADERS})
    list(TRANSFORM arg_HEADERS PREPEND ${CMAKE_CURRENT_SOURCE_DIR}/)
    set_property(TARGET ${target} PROPERTY KA_INSTALLED_HEADERS ${arg_HEADERS})
endfunction()

# ka_outer_layer(<target> LINKS <targets...> HEADERS <...> SOURCES <...> [WIDGETS])
#
# A folder around the module, which the programs share: a static library, and its headers alone as <target>_api. It sees
# the headers of the layers that it names, and is linked with the module as the program at the end wants it (ka_module).
function(ka_outer_layer target)
    cmake_parse_arguments(arg "WIDGETS" "" "LINKS;HEADERS;SOURCES" ${ARGN})
    ka_apis(apis ${arg_LINKS})
    add_library(${target}_api INTERFACE)
    target_include_directories(${target}_api INTERFACE ${CMAKE_CURRENT_SOURCE_DIR})
    target_link_libraries(${target}_api INTERFACE ${apis})

    add_library(${target} STATIC ${arg_SOURCES})
    target_sources(${target} PUBLIC FILE_SET HEADERS BASE_DIRS ${CMAKE_CURRENT_SOURCE_DIR} FILES ${arg_HEADERS})
    set(outer)
    foreach(link IN LISTS arg_LINKS)
        if(NOT TARGET ${link}_objects) # a layer of the module comes with it
            list(APPEND outer ${link})
        endif()
    endforeach()
    target_link_libraries(${target} PUBLIC ${target}_api ${outer} $<LINK_ONLY:ka_module> PRIVATE ka_options ka_hardening)
    ka_precompile(${target} "${arg_WIDGETS}")
endfunction()

# The layers of the module among some targets, as their headers alone.
function(ka_apis result)
    set(apis)
    foreach(target IN LISTS ARGN)
        if(TARGET ${target}_api)
            list(APPEND apis ${target}_api)
        else()
            list(APPEND apis ${target})
        endif()
    endforeach()
    set(${result} ${apis} PARENT_SCOPE)
endfunction()

# What needs the module needs it in one of two ways. A program links the shared libraries; a target with the property
# KA_LINKS_LAYERS, as tests have, links the layers themselves. Both in one program would be two of every variable.
add_library(ka_module INTERFACE)
target_link_libraries(ka_module INTERFACE $<IF:$<BOOL:$<TARGET_PROPERTY:KA_LINKS_LAYERS>>,ka_ui,KaReport>)
