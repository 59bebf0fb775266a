include(CMakePackageConfigHelpers)

# The one installed library, made of the layers; it needs nothing but the standard library.
get_property(qrx_layers GLOBAL PROPERTY QRX_LAYERS)
list(TRANSFORM qrx_layers REPLACE "(.+)" "$<TARGET_OBJECTS:\\1>" OUTPUT_VARIABLE qrx_objects)
add_library(QRXZptInputFileWriter ${qrx_objects})
add_library(QRX::QRXZptInputFileWriter ALIAS QRXZptInputFileWriter)
if(QRX_SANITIZED_TESTS)
    list(TRANSFORM qrx_layers REPLACE "(.+)" "$<TARGET_OBJECTS:\\1_sanitized>" OUTPUT_VARIABLE qrx_sanitized_objects)
    add_library(QRXZptInputFileWriter_sanitized STATIC ${qrx_sanitized_objects})
    target_include_directories(QRXZptInputFileWriter_sanitized PUBLIC
        ${PROJECT_SOURCE_DIR} ${PROJECT_SOURCE_DIR}/QRXZptIfwOif.m/src)
endif()
set(QRX_INCLUDE_SUBDIR QRXZptInputFileWriter-${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
# Threads may be a library of their own in older systems.
set(THREADS_PREFER_PTHREAD_FLAG ON)
find_package(Threads REQUIRED)
# Beside the library as it is built here, that is statically unless BUILD_SHARED_LIBS says otherwise, a shared one.
set(qrx_libraries QRXZptInputFileWriter)
if(QRX_SHARED_LIBRARY AND NOT BUILD_SHARED_LIBS)
    add_library(QRXZptInputFileWriter_shared SHARED ${qrx_objects})
    add_library(QRX::QRXZptInputFileWriter_shared ALIAS QRXZptInputFileWriter_shared)
    set_target_properties(QRXZptInputFileWriter_shared PROPERTIES OUTPUT_NAME QRXZptInputFileWriter)
    target_link_libraries(QRXZptInputFileWriter_shared PRIVATE qrx_hardened)
    list(APPEND qrx_libraries QRXZptInputFileWriter_shared)
endif()
# A minor version may add members to classes: programs link to the version that they were compiled for.
set(QRX_SYMBOL_VERSION QRX_${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
configure_file(${CMAKE_CURRENT_LIST_DIR}/QRXZptInputFileWriter.map ${PROJECT_BINARY_DIR}/QRXZptInputFileWriter.map @ONLY)
include(CheckLinkerFlag)
# Not as LINKER:, which would take a comma in the folder's name for the end of the word.
set(qrx_version_script "SHELL:-Xlinker \"--version-script=${PROJECT_BINARY_DIR}/QRXZptInputFileWriter.map\"")
check_linker_flag(CXX "${qrx_version_script}" QRX_HAS_VERSION_SCRIPTS)
foreach(library ${qrx_libraries})
    target_include_directories(${library} PUBLIC
        $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>
        $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/QRXZptIfwOif.m/src>
        $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/${QRX_INCLUDE_SUBDIR}>)
    target_compile_features(${library} PUBLIC cxx_std_20)
    target_link_libraries(${library} PUBLIC Threads::Threads)
    set_target_properties(${library} PROPERTIES VERSION ${PROJECT_VERSION}
        SOVERSION ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
    get_target_property(type ${library} TYPE)
    # Where linkers have no such scripts, everything is shown.
    if(type STREQUAL "SHARED_LIBRARY" AND QRX_HAS_VERSION_SCRIPTS)
        target_link_options(${library} PRIVATE "${qrx_version_script}")
        set_target_properties(${library} PROPERTIES LINK_DEPENDS ${PROJECT_BINARY_DIR}/QRXZptInputFileWriter.map)
    endif()
endforeach()

# Installed headers keep the paths that they have in the tree, so that includes read the same there.
set(qrx_include_dir ${CMAKE_INSTALL_INCLUDEDIR}/${QRX_INCLUDE_SUBDIR})
foreach(layer platform foundation store_interface keyword_layer deck_checks whole_file)
    install(DIRECTORY ${PROJECT_SOURCE_DIR}/${layer}/ DESTINATION ${qrx_include_dir}/${layer} COMPONENT development
        FILES_MATCHING PATTERN "*.h" PATTERN "*.inl" PATTERN windows EXCLUDE)
endforeach()
install(DIRECTORY ${PROJECT_SOURCE_DIR}/QRXZptIfwOif.m/src/ DESTINATION ${qrx_include_dir} OPTIONAL
    COMPONENT development FILES_MATCHING PATTERN "*.h")

set(qrx_package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/QRXZptInputFileWriter)
install(TARGETS ${qrx_libraries} EXPORT QRXZptInputFileWriterTargets
    ARCHIVE COMPONENT development LIBRARY COMPONENT development RUNTIME COMPONENT development)
install(EXPORT QRXZptInputFileWriterTargets NAMESPACE QRX:: DESTINATION ${qrx_package_dir} COMPONENT development)
configure_package_config_file(${CMAKE_CURRENT_LIST_DIR}/QRXZptInputFileWriterConfig.cmake.in
    ${PROJECT_BINARY_DIR}/QRXZptInputFileWriterConfig.cmake INSTALL_DESTINATION ${qrx_package_dir})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/QRXZptInputFileWriterConfigVersion.cmake
    COMPATIBILITY SameMajorVersion)
install(FILES ${PROJECT_BINARY_DIR}/QRXZptInputFileWriterConfig.cmake
    ${PROJECT_BINARY_DIR}/QRXZptInputFileWriterConfigVersion.cmake DESTINATION ${qrx_package_dir}
    COMPONENT development)

# Found from its own place, the pkg-config file stays right when the installed tree is moved.
file(RELATIVE_PATH QRX_PREFIX_FROM_PKGCONFIG ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig ${CMAKE_INSTALL_PREFIX})
configure_file(${CMAKE_CURRENT_LIST_DIR}/QRXZptInputFileWriter.pc.in
    ${PROJECT_BINARY_DIR}/QRXZptInputFileWriter.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/QRXZptInputFileWriter.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig
    COMPONENT development)
