# What users get answers an overrun buffer, a smashed stack or a changed jump with an end of the program. Targets that are
# installed link this; tests, which are built without optimisation, do not.
include(CheckCXXCompilerFlag)
include(CheckPIESupported)
check_pie_supported(LANGUAGES CXX)

add_library(ka_hardening INTERFACE)
set(hardening -fstack-protector-strong -fstack-clash-protection -fcf-protection)
if(KA_SYSTEM STREQUAL Windows)
    # Every function with a large frame probes its stack there anyway, and GCC 12 fails on some that are to do so twice.
    list(REMOVE_ITEM hardening -fstack-clash-protection)
endif()
foreach(flag IN LISTS hardening)
    string(MAKE_C_IDENTIFIER KAREPORT_HAS${flag} has_flag)
    check_cxx_compiler_flag(${flag} ${has_flag}) # not every processor has each
    if(${has_flag})
        target_compile_options(ka_hardening INTERFACE ${flag})
    endif()
endforeach()
if(NOT KAREPORT_SANITIZE)
    # The checks of lengths need the optimizer. Sanitizers bring their own.
    target_compile_options(ka_hardening INTERFACE
                           $<$<CONFIG:Release,RelWithDebInfo,MinSizeRel>:-U_FORTIFY_SOURCE;-D_FORTIFY_SOURCE=2>)
endif()
if(KA_SYSTEM STREQUAL Windows AND CMAKE_CXX_COMPILER_ID STREQUAL GNU)
    target_link_libraries(ka_hardening INTERFACE ssp) # what the checks call is not part of the C library there
endif()
# All addresses are bound at the start, and the tables of them are read-only from then on.
target_link_options(ka_hardening INTERFACE $<$<PLATFORM_ID:Linux>:LINKER:-z,relro;LINKER:-z,now>)
