# Finds nlohmann-json and CLI11, of which programs take nothing but headers. A toolchain names the folder that has them
# in QRX_HEADERS_OF_OTHERS; else they are installed packages.
if(QRX_HEADERS_OF_OTHERS)
    foreach(target nlohmann_json::nlohmann_json CLI11::CLI11)
        if(NOT TARGET ${target})
            add_library(${target} INTERFACE IMPORTED GLOBAL)
            target_include_directories(${target} SYSTEM INTERFACE ${QRX_HEADERS_OF_OTHERS})
        endif()
    endforeach()
else()
    find_package(nlohmann_json 3 REQUIRED)
    find_package(CLI11 REQUIRED)
endif()
