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
target_include_directories(QRXZptInputFileWriter PUBLIC
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/QRXZptIfwOif.m/src>
    $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/${QRX_INCLUDE_SUBDIR}>)
target_compile_features(QRXZptInputFileWriter PUBLIC cxx_std_20)
# Threads may be a library of their own in older systems.
set(THREADS_PREFER_PTHREAD_FLAG ON)
find_package(Threads REQUIRED)
target_link_libraries(QRXZptInputFileWriter PUBLIC Threads::Threads)
set_target_properties(QRXZptInputFileWriter PROPERTIES
    VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR})

# Installed headers keep the paths that they have in the tree, so that includes read the same there.
set(qrx_include_dir ${CMAKE_INSTALL_INCLUDEDIR}/${QRX_INCLUDE_SUBDIR})
foreach(layer foundation store_interface keyword_layer deck_checks whole_file)
    install(DIRECTORY ${PROJECT_SOURCE_DIR}/${layer}/ DESTINATION ${qrx_include_dir}/${layer}
        FILES_MATCHING PATTERN "*.h" PATTERN "*.inl")
endforeach()
install(DIRECTORY ${PROJECT_SOURCE_DIR}/QRXZptIfwOif.m/src/ DESTINATION ${qrx_include_dir} OPTIONAL
    FILES_MATCHING PATTERN "*.h")

set(qrx_package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/QRXZptInputFileWriter)
install(TARGETS QRXZptInputFileWriter EXPORT QRXZptInputFileWriterTargets)
install(EXPORT QRXZptInputFileWriterTargets NAMESPACE QRX:: DESTINATION ${qrx_package_dir})
configure_package_config_file(${CMAKE_CURRENT_LIST_DIR}/QRXZptInputFileWriterConfig.cmake.in
    ${PROJECT_BINARY_DIR}/QRXZptInputFileWriterConfig.cmake INSTALL_DESTINATION ${qrx_package_dir})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/QRXZptInputFileWriterConfigVersion.cmake
    COMPATIBILITY SameMajorVersion)
install(FILES ${PROJECT_BINARY_DIR}/QRXZptInputFileWriterConfig.cmake
    ${PROJECT_BINARY_DIR}/QRXZptInputFileWriterConfigVersion.cmake DESTINATION ${qrx_package_dir})

# Found from its own place, the pkg-config file stays right when the installed tree is moved.
file(RELATIVE_PATH QRX_PREFIX_FROM_PKGCONFIG ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig ${CMAKE_INSTALL_PREFIX})
configure_file(${CMAKE_CURRENT_LIST_DIR}/QRXZptInputFileWriter.pc.in
    ${PROJECT_BINARY_DIR}/QRXZptInputFileWriter.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/QRXZptInputFileWriter.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
