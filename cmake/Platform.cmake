# What differs from system to system is in pairs of files behind one header, such as SignalsPosix.cpp and SignalsWindows.cpp:
# a list of sources names the half of this system as Signals${KA_SYSTEM}.cpp.
if(WIN32)
    set(KA_SYSTEM Windows)
    enable_language(RC)
else()
    set(KA_SYSTEM Posix)
endif()

# ka_program(<target> SOURCES <...> [WINDOWS] [DESCRIPTION <text>])
#
# A program of this project, in one folder with the others, as they are installed. WINDOWS says that it shows windows and has no
# use for a console.
function(ka_program target)
    cmake_parse_arguments(arg "WINDOWS" "DESCRIPTION" "SOURCES" ${ARGN})
    add_executable(${target} ${arg_SOURCES})
    set_target_properties(${target} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/bin)
    if(KA_SYSTEM STREQUAL Windows)
        set_target_properties(${target} PROPERTIES WIN32_EXECUTABLE "${arg_WINDOWS}")
        ka_describe_program(${target} "${arg_DESCRIPTION}")
    endif()
endfunction()

# What the system shows of a program and asks of it: icon, version, and what it is prepared for.
function(ka_describe_program KA_PROGRAM KA_DESCRIPTION)
    set(icon ${PROJECT_SOURCE_DIR}/packaging/windows/kareport.ico)
    set(KA_ICON)
    if(EXISTS ${icon})
        set(KA_ICON "1 ICON \"${icon}\"")
    endif()
    set(resource ${CMAKE_CURRENT_BINARY_DIR}/${KA_PROGRAM}.rc)
    configure_file(${PROJECT_SOURCE_DIR}/packaging/windows/program.rc.in ${resource} @ONLY)
    set_source_files_properties(${resource} PROPERTIES
        INCLUDE_DIRECTORIES ${PROJECT_SOURCE_DIR}/packaging/windows
        OBJECT_DEPENDS ${PROJECT_SOURCE_DIR}/packaging/windows/program.manifest)
    target_sources(${KA_PROGRAM} PRIVATE ${resource})
endfunction()

# Static libraries do not say what they need themselves.
option(KAREPORT_STATIC_LIBRARIES "The libraries, but Qt's, are static ones" OFF)
function(ka_complete_static_libraries)
    find_package(ZLIB REQUIRED)
    find_package(PNG REQUIRED)
    find_package(EXPAT REQUIRED)
    target_link_libraries(PNG::PNG INTERFACE ZLIB::ZLIB)
    target_link_libraries(Freetype::Freetype INTERFACE PNG::PNG ZLIB::ZLIB)
    target_link_libraries(Fontconfig::Fontconfig INTERFACE Freetype::Freetype EXPAT::EXPAT)
    add_library(ka_zipped INTERFACE)
    target_link_libraries(ka_zipped INTERFACE PNG::PNG ZLIB::ZLIB)
endfunction()
