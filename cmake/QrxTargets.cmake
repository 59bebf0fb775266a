# Flags that every target of the project is built with.
add_library(qrx_flags INTERFACE)
target_compile_options(qrx_flags INTERFACE
    -Wall -Wextra -Wpedantic -Wshadow -Wconversion
    # Lengths and axes are rounded operation by operation, on every machine.
    -ffp-contract=off
    # g++ 12 sees overlaps that can't be where std::string is put together.
    $<$<AND:$<CXX_COMPILER_ID:GNU>,$<VERSION_LESS:$<CXX_COMPILER_VERSION>,13>>:-Wno-restrict>
    $<$<BOOL:${QRX_WARNINGS_AS_ERRORS}>:-Werror>)

# qrx_layer(NAME): the sources of this folder as one layer of the core; a folder without sources adds none.
function(qrx_layer name)
    file(GLOB_RECURSE sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp)
    add_library(${name} OBJECT ${sources})
    target_include_directories(${name} PUBLIC
        $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>
        $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/QRXZptIfwOif.m/src>)
    target_link_libraries(${name} PRIVATE $<BUILD_INTERFACE:qrx_flags>)
    set_property(GLOBAL APPEND PROPERTY QRX_LAYERS ${name})
endfunction()
