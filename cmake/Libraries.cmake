# Two shared libraries are made of the layers: the report module, and the stand-in host that it is linked against. A host
# that brings its own values, data, application and frame links its own library in the place of KaReportHost.

set(KA_HOST_LAYERS ka_values ka_data ka_app ka_frame)
set(KA_MODULE_LAYERS ka_templates ka_page ka_output ka_report ka_view ka_ui)

function(ka_shared_library target)
    set(objects)
    set(includes)
    set(headers)
    foreach(layer IN LISTS ARGN)
        list(APPEND objects $<TARGET_OBJECTS:${layer}>)
        get_target_property(directory ${layer} SOURCE_DIR)
        list(APPEND includes $<BUILD_INTERFACE:${directory}>)
        get_property(layer_headers TARGET ${layer} PROPERTY KA_INSTALLED_HEADERS)
        list(APPEND headers ${layer_headers})
    endforeach()
    add_library(${target} SHARED ${objects})
    set_target_properties(${target} PROPERTIES LINKER_LANGUAGE CXX VERSION ${PROJECT_VERSION} SOVERSION 0
                                               INSTALL_RPATH "$ORIGIN")
    target_include_directories(${target} INTERFACE ${includes} $<INSTALL_INTERFACE:include/KaReport>)
    target_compile_features(${target} INTERFACE cxx_std_20)
    target_link_libraries(${target} PRIVATE ka_options ka_hardening)
    set_property(TARGET ${target} PROPERTY KA_INSTALLED_HEADERS ${headers})
endfunction()

ka_shared_library(KaReportHost ${KA_HOST_LAYERS})
target_link_libraries(KaReportHost PUBLIC Qt6::Core Qt6::Widgets)

ka_shared_library(KaReport ${KA_MODULE_LAYERS})
target_link_libraries(KaReport PUBLIC KaReportHost Qt6::Gui PRIVATE Qt6::PrintSupport Fontconfig::Fontconfig Freetype::Freetype ${HPDF_LIBRARY})
