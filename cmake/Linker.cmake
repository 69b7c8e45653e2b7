# Linking the test programs takes most of the time of a build after a change of one file: the preset dev asks for a faster
# linker than the compiler's own. It must take the members of an archive in the order of the command line, as test programs
# link the support library without all the layers that it sees. What users get is linked with the compiler's own.
if(KAREPORT_LINKER)
    find_program(KAREPORT_LINKER_PROGRAM NAMES ${KAREPORT_LINKER} ld.${KAREPORT_LINKER})
    if(KAREPORT_LINKER_PROGRAM)
        add_link_options(-fuse-ld=${KAREPORT_LINKER})
    else()
        message(STATUS "The linker ${KAREPORT_LINKER} is not installed")
    endif()
endif()
