# Sets qrx_page_source to the source file with the page's text, and QRX_HAS_PAGE. The page needs node and the packages
# that scripts/install-dependencies.sh viewer puts into viewer/node_modules; building it uses no network.
find_program(QRX_NODE NAMES node nodejs)
set(viewer ${PROJECT_SOURCE_DIR}/viewer)
set(page_dir ${CMAKE_CURRENT_BINARY_DIR}/page)
set(QRX_HAS_PAGE OFF)
if(QRX_NODE AND EXISTS ${viewer}/node_modules/esbuild AND EXISTS ${viewer}/node_modules/three)
    set(QRX_HAS_PAGE ON)
endif()
# The tests of the page need to know too.
set(QRX_HAS_PAGE ${QRX_HAS_PAGE} CACHE INTERNAL "The page of qrxdeck view is built in")

set(qrx_page_source ${page_dir}/PageText.cpp)
file(MAKE_DIRECTORY ${page_dir})
if(QRX_HAS_PAGE)
    file(GLOB_RECURSE page_sources CONFIGURE_DEPENDS
        ${viewer}/src/*.ts ${viewer}/src/*.css ${viewer}/src/*.html ${viewer}/build.mjs ${viewer}/package-lock.json)
    add_custom_command(OUTPUT ${qrx_page_source}
        COMMAND ${QRX_NODE} ${viewer}/build.mjs ${qrx_page_source}
        DEPENDS ${page_sources} COMMENT "Bundling the page of qrxdeck view" VERBATIM)
    add_custom_target(qrx_page DEPENDS ${qrx_page_source})
else()
    message(STATUS "qrxdeck view: no page built in; scripts/install-dependencies.sh viewer gets what it takes")
    file(CONFIGURE OUTPUT ${qrx_page_source} CONTENT
        "#include \"view_page/vpg_Html.h\"\n\nstd::string_view vpg_PageText() {\n    return {};\n}\n")
endif()
