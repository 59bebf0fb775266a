# The one installed library, made of the four layers; it needs nothing but the standard library.
add_library(QRXZptInputFileWriter
    $<TARGET_OBJECTS:qrx_foundation> $<TARGET_OBJECTS:qrx_store>
    $<TARGET_OBJECTS:qrx_keyword> $<TARGET_OBJECTS:qrx_deck_writer>)
add_library(QRX::QRXZptInputFileWriter ALIAS QRXZptInputFileWriter)
set(QRX_INCLUDE_SUBDIR QRXZptInputFileWriter-${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
target_include_directories(QRXZptInputFileWriter PUBLIC
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/QRXZptIfwOif.m/src>
    $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/${QRX_INCLUDE_SUBDIR}>)
target_compile_features(QRXZptInputFileWriter PUBLIC cxx_std_20)
set_target_properties(QRXZptInputFileWriter PROPERTIES
    VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR})
