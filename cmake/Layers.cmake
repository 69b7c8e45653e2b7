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
if(KA_SYSTEM STREQUAL Windows) # of its headers, the names that are needed
    target_compile_definitions(ka_options INTERFACE NOMINMAX WIN32_LEAN_AND_MEAN)
endif()
if(KAREPORT_WERROR)
    target_compile_options(ka_options INTERFACE -Werror)
endif()
# Several sources that are compiled together are one file to the compiler, and only the main one may keep a class to itself.
# What GCC finds uninitialized in so much inlined code is not; in the release, file by file, it looks.
if(CMAKE_UNITY_BUILD)
    target_compile_options(ka_options INTERFACE -Wno-subobject-linkage -Wno-maybe-uninitialized)
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

# What compiles them for all others.
set(KA_PRECOMPILING ka_values_objects ka_frame_objects)

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
#          [COMMON_SOURCES <...>] [WIDGETS])
#
# A folder of the module or of the host. LINKS are the layers below and what the headers need of other libraries; USES is
# what the sources alone need. HEADERS are what a host program includes, and are installed; only what they mark with
# KAREPORT_EXPORT is offered by the shared libraries. PRIVATE_HEADERS serve the layers above inside this project.
# COMMON_SOURCES, of a host's folder, are what the module needs as well without asking its host for it: each shared library
# has them for itself, so they keep nothing that both would have to know. WIDGETS says that the sources see Qt's windows.
#
# Targets are made for the two ways in which the same code is linked:
#   <target>_api      the headers of this layer and of those below it; nothing is linked by it
#   <target>_objects  the compiled sources, which a shared library is made of; <target>_common_objects the common ones
#   <target>          the layer and those below it as static libraries, for all else in this project: programs, tests and
#                     benchmarks use more than the shared libraries offer
function(ka_layer target)
    cmake_parse_arguments(arg "WIDGETS" "" "LINKS;USES;HEADERS;PRIVATE_HEADERS;SOURCES;COMMON_SOURCES" ${ARGN})
    ka_api(${target} ${arg_LINKS})
    set(objects ${target}_objects)
    add_library(${target}_objects OBJECT ${arg_SOURCES})
    if(arg_COMMON_SOURCES)
        add_library(${target}_common_objects OBJECT ${arg_COMMON_SOURCES})
        list(APPEND objects ${target}_common_objects)
    endif()
    foreach(library IN LISTS objects)
        target_link_libraries(${library} PUBLIC ${target}_api ${arg_USES} PRIVATE ka_options ka_hardening)
        ka_precompile(${library} "${arg_WIDGETS}")
        if(NOT library IN_LIST KA_PRECOMPILING)
            target_compile_definitions(${library} PRIVATE KAREPORT_BUILDING)
        endif()
    endforeach()
    if(${target}_objects IN_LIST KA_PRECOMPILING)
        # Not of the target: its compiled headers serve what is outside the libraries as well.
        set_source_files_properties(${arg_SOURCES} ${arg_COMMON_SOURCES} PROPERTIES COMPILE_DEFINITIONS KAREPORT_BUILDING)
    endif()

    add_library(${target} STATIC)
    target_link_libraries(${target} PUBLIC ${objects} ${target}_api ${arg_LINKS} ${arg_USES})
    target_sources(${target} PUBLIC FILE_SET HEADERS BASE_DIRS ${CMAKE_CURRENT_SOURCE_DIR}
                   FILES ${arg_HEADERS} ${arg_PRIVATE_HEADERS})
    list(TRANSFORM arg_HEADERS PREPEND ${CMAKE_CURRENT_SOURCE_DIR}/)
    set_property(TARGET ${target} PROPERTY KA_INSTALLED_HEADERS ${arg_HEADERS})
endfunction()

# ka_outer_layer(<target> LINKS <targets...> HEADERS <...> SOURCES <...> [WIDGETS])
#
# A folder around the module, which the programs share: a static library, and its headers alone as <target>_api.
function(ka_outer_layer target)
    cmake_parse_arguments(arg "WIDGETS" "" "LINKS;HEADERS;SOURCES" ${ARGN})
    ka_api(${target} ${arg_LINKS})
    add_library(${target} STATIC ${arg_SOURCES})
    target_sources(${target} PUBLIC FILE_SET HEADERS BASE_DIRS ${CMAKE_CURRENT_SOURCE_DIR} FILES ${arg_HEADERS})
    target_link_libraries(${target} PUBLIC ${target}_api ${arg_LINKS} PRIVATE ka_options ka_hardening)
    ka_precompile(${target} "${arg_WIDGETS}")
endfunction()

# The headers of a layer, with those of the layers that it links, as <target>_api.
function(ka_api target)
    add_library(${target}_api INTERFACE)
    if(KA_SYSTEM STREQUAL Windows)
        target_compile_definitions(${target}_api INTERFACE KAREPORT_STATIC) # whoever sees it links it into itself
    endif()
    target_include_directories(${target}_api INTERFACE ${CMAKE_CURRENT_SOURCE_DIR})
    foreach(link IN LISTS ARGN)
        if(TARGET ${link}_api)
            set(link ${link}_api)
        endif()
        target_link_libraries(${target}_api INTERFACE ${link})
    endforeach()
endfunction()
