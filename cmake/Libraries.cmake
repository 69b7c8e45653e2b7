# Two shared libraries are made of the layers, for programs outside of this project: the report module, and the stand-in host
# that it is linked against. A host that brings its own values, data, application and frame links its own library in the
# place of KaReportHost. The programs of this project link the layers themselves.

set(KA_HOST_LAYERS ka_values ka_data ka_app ka_frame)
set(KA_MODULE_LAYERS ka_templates ka_groups ka_page ka_reportfile ka_richtext ka_pdf ka_editor ka_report ka_print ka_view ka_ui)

function(ka_shared_library target)
    add_library(${target} SHARED)
    set_target_properties(${target} PROPERTIES LINKER_LANGUAGE CXX VERSION ${PROJECT_VERSION} SOVERSION 0
                                               INSTALL_RPATH "$ORIGIN")
    target_link_libraries(${target} PRIVATE ka_options ka_hardening)
    if(NOT KAREPORT_SANITIZE) # whose functions come with the program
        # What the module asks of its host must be offered there.
        target_link_options(${target} PRIVATE $<$<PLATFORM_ID:Linux>:LINKER:-z,defs>)
    endif()
    set(headers)
    foreach(layer IN LISTS ARGN)
        target_link_libraries(${target} PRIVATE ${layer}_objects)
        get_property(layer_headers TARGET ${layer} PROPERTY KA_INSTALLED_HEADERS)
        list(APPEND headers ${layer_headers})
    endforeach()
    set_property(TARGET ${target} PROPERTY KA_INSTALLED_HEADERS ${headers})
endfunction()

ka_shared_library(KaReportHost ${KA_HOST_LAYERS})
ka_shared_library(KaReport ${KA_MODULE_LAYERS})
target_link_libraries(KaReport PRIVATE KaReportHost)
foreach(layer IN LISTS KA_HOST_LAYERS)
    if(TARGET ${layer}_common_objects)
        target_link_libraries(KaReportHost PRIVATE ${layer}_common_objects)
        target_link_libraries(KaReport PRIVATE ${layer}_common_objects)
    endif()
endforeach()

# What a program outside links: KaReport::KaReport is the module with its stand-in host. A host that brings a library of its
# own compiles that with KaReport::Headers, and links it with KaReport::Module.
add_library(ka_package_headers INTERFACE)
set_target_properties(ka_package_headers PROPERTIES EXPORT_NAME Headers)
target_include_directories(ka_package_headers INTERFACE $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>)
target_compile_features(ka_package_headers INTERFACE cxx_std_20)
target_link_libraries(ka_package_headers INTERFACE Qt6::Core Qt6::Gui Qt6::Widgets Qt6::PrintSupport)
target_link_libraries(KaReportHost INTERFACE ka_package_headers)
target_link_libraries(KaReport INTERFACE ka_package_headers)
set_target_properties(KaReport PROPERTIES EXPORT_NAME Module)
add_library(ka_package INTERFACE)
set_target_properties(ka_package PROPERTIES EXPORT_NAME KaReport)
target_link_libraries(ka_package INTERFACE KaReport KaReportHost)
