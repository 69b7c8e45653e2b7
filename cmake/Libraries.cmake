# Two shared libraries are made of the layers: the report module, and the stand-in host that it is linked against. A host
# that brings its own values, data, application and frame links its own library in the place of KaReportHost.

set(KA_HOST_LAYERS ka_values ka_data ka_app ka_frame)
set(KA_MODULE_LAYERS ka_templates ka_page ka_reportfile ka_richtext ka_pdf ka_editor ka_report ka_print ka_view ka_ui)

function(ka_shared_library target)
    add_library(${target} SHARED)
    set_target_properties(${target} PROPERTIES LINKER_LANGUAGE CXX VERSION ${PROJECT_VERSION} SOVERSION 0
                                               INSTALL_RPATH "$ORIGIN")
    target_include_directories(${target} INTERFACE $<INSTALL_INTERFACE:include/KaReport>)
    target_compile_features(${target} INTERFACE cxx_std_20)
    target_link_libraries(${target} PRIVATE ka_options ka_hardening)
    set(headers)
    foreach(layer IN LISTS ARGN)
        target_link_libraries(${target} PRIVATE ${layer}_objects INTERFACE $<BUILD_INTERFACE:${layer}_api>)
        get_property(layer_headers TARGET ${layer} PROPERTY KA_INSTALLED_HEADERS)
        list(APPEND headers ${layer_headers})
    endforeach()
    set_property(TARGET ${target} PROPERTY KA_INSTALLED_HEADERS ${headers})
endfunction()

ka_shared_library(KaReportHost ${KA_HOST_LAYERS})
target_link_libraries(KaReportHost PUBLIC Qt6::Core Qt6::Widgets)

ka_shared_library(KaReport ${KA_MODULE_LAYERS})
target_link_libraries(KaReport PUBLIC KaReportHost Qt6::Gui)
