# Flags that every target of the project is built with.
add_library(qrx_flags INTERFACE)
target_compile_options(qrx_flags INTERFACE
    -Wall -Wextra -Wpedantic -Wshadow -Wconversion
    # Lengths and axes are rounded operation by operation, on every machine.
    -ffp-contract=off
    # g++ 12 sees overlaps that can't be where std::string is put together.
    $<$<AND:$<CXX_COMPILER_ID:GNU>,$<VERSION_LESS:$<CXX_COMPILER_VERSION>,13>>:-Wno-restrict>
    # clang 16 doesn't see that a loop's condition is changed by what the loop calls.
    $<$<CXX_COMPILER_ID:Clang>:-Wno-for-loop-analysis>
    # g++ looks for memory to free from 128 MB on, where half a GB saves a tenth of its time.
    $<$<CXX_COMPILER_ID:GNU>:--param=ggc-min-heapsize=524288>
    $<$<BOOL:${QRX_WARNINGS_AS_ERRORS}>:-Werror>)

# g++ 12 warns of the standard library's own code when it comes precompiled.
add_library(qrx_precompiled INTERFACE)
target_compile_options(qrx_precompiled INTERFACE
    $<$<AND:$<CXX_COMPILER_ID:GNU>,$<VERSION_LESS:$<CXX_COMPILER_VERSION>,13>>:-Wno-array-bounds
        -Wno-stringop-overflow -Wno-stringop-overread>)

# How release builds of the libraries and the program guard themselves: checked calls of the C library, guarded
# stacks, marked targets of jumps where the processor knows them, addresses that differ from run to run, and
# tables of addresses that are filled and locked before the program begins.
include(CheckCXXCompilerFlag)
include(CheckPIESupported)
check_pie_supported(LANGUAGES CXX)
check_cxx_compiler_flag(-fcf-protection=full QRX_HAS_CF_PROTECTION)
check_cxx_compiler_flag(-fstack-clash-protection QRX_HAS_STACK_CLASH_PROTECTION)
add_library(qrx_hardened INTERFACE)
# Linkers for Windows guard programs without being told.
if(NOT WIN32)
    target_compile_options(qrx_hardened INTERFACE
        $<$<CONFIG:Release>:-U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=2 -fstack-protector-strong
            $<$<BOOL:${QRX_HAS_CF_PROTECTION}>:-fcf-protection=full>
            $<$<BOOL:${QRX_HAS_STACK_CLASH_PROTECTION}>:-fstack-clash-protection>>)
    target_link_options(qrx_hardened INTERFACE $<$<CONFIG:Release>:LINKER:-z,relro,-z,now>)
endif()

# What the second build of each library is made with, that the tests are linked to as well. Optimising would cost
# more time than it saves the tests.
add_library(qrx_sanitizers INTERFACE)
# Null pointers and the ends of objects are the address sanitizer's too; asking twice takes a quarter of the time.
# Alignment, a sixth of it, is left to the presets asan and fuzz.
set(QRX_SANITIZER_FLAGS -fsanitize=address,undefined -fno-sanitize=null,object-size,alignment -fno-sanitize-recover=all
    -fno-omit-frame-pointer)
target_compile_options(qrx_sanitizers INTERFACE ${QRX_SANITIZER_FLAGS} -O0 -g1)
target_link_options(qrx_sanitizers INTERFACE ${QRX_SANITIZER_FLAGS})

# What has no loops over nodes or rows of its own, or none that count, takes a third less to compile with this.
add_library(qrx_brief INTERFACE)
target_compile_options(qrx_brief INTERFACE $<$<CONFIG:Release>:-O1>)

# qrx_fixed_address(NAME): a sanitized program that starts in half the time, as its three million addresses are known
# when it is linked.
function(qrx_fixed_address name)
    set_target_properties(${name} PROPERTIES POSITION_INDEPENDENT_CODE OFF)
endfunction()

# qrx_sanitized(LIST NAMES...): the targets of the second build where there are such, else the names as they are.
function(qrx_sanitized list)
    set(found)
    foreach(name ${ARGN})
        if(TARGET ${name}_sanitized)
            list(APPEND found ${name}_sanitized)
        else()
            list(APPEND found ${name})
        endif()
    endforeach()
    set(${list} ${found} PARENT_SCOPE)
endfunction()

# qrx_library(NAME TYPE SOURCES... [PUBLIC LIBS...] [PRIVATE LIBS...] [PRECOMPILE HEADERS...]): a library of the
# project and, under QRX_SANITIZED_TESTS, its double NAME_sanitized. Under QRX_UNITY_BUILD its sources are compiled as
# one, so names differ even where they are local.
function(qrx_library name type)
    cmake_parse_arguments(ARG "" "" "SOURCES;PUBLIC;PRIVATE;PRECOMPILE" ${ARGN})
    set(variants ${name})
    if(QRX_SANITIZED_TESTS)
        list(APPEND variants ${name}_sanitized)
    endif()
    foreach(variant ${variants})
        set(public ${ARG_PUBLIC})
        set(private ${ARG_PRIVATE})
        if(NOT variant STREQUAL name)
            qrx_sanitized(public ${ARG_PUBLIC})
            qrx_sanitized(private ${ARG_PRIVATE})
            list(APPEND private $<BUILD_INTERFACE:qrx_sanitizers>)
        endif()
        add_library(${variant} ${type} ${ARG_SOURCES})
        set_target_properties(${variant} PROPERTIES UNITY_BUILD ${QRX_UNITY_BUILD} UNITY_BUILD_BATCH_SIZE 0)
        target_include_directories(${variant} PUBLIC
            $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>
            $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/QRXZptIfwOif.m/src>)
        if(variant STREQUAL name)
            list(APPEND private $<BUILD_INTERFACE:qrx_hardened>)
        endif()
        target_link_libraries(${variant} PUBLIC ${public} PRIVATE $<BUILD_INTERFACE:qrx_flags> ${private})
        if(QRX_PRECOMPILED_HEADERS AND ARG_PRECOMPILE AND NOT QRX_UNITY_BUILD)
            target_precompile_headers(${variant} PRIVATE ${ARG_PRECOMPILE})
            target_link_libraries(${variant} PRIVATE $<BUILD_INTERFACE:qrx_precompiled>)
        endif()
    endforeach()
endfunction()

# qrx_layer(NAME [BRIEF REGEX] [PRECOMPILE HEADERS...]): the sources of this folder as one layer of the core; those
# whose paths match the expression are qrx_brief.
function(qrx_layer name)
    cmake_parse_arguments(ARG "" "BRIEF" "PRECOMPILE" ${ARGN})
    file(GLOB_RECURSE sources CONFIGURE_DEPENDS ${CMAKE_CURRENT_SOURCE_DIR}/*.cpp)
    set(layers ${name})
    if(ARG_BRIEF)
        set(brief ${sources})
        list(FILTER brief INCLUDE REGEX "${ARG_BRIEF}")
        list(FILTER sources EXCLUDE REGEX "${ARG_BRIEF}")
        qrx_library(${name}_brief OBJECT SOURCES ${brief} PRIVATE $<BUILD_INTERFACE:qrx_brief>
            PRECOMPILE ${ARG_PRECOMPILE})
        list(APPEND layers ${name}_brief)
    endif()
    qrx_library(${name} OBJECT SOURCES ${sources} PRECOMPILE ${ARG_PRECOMPILE})
    set_property(GLOBAL APPEND PROPERTY QRX_LAYERS ${layers})
endfunction()
