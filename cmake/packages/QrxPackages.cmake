# What `cpack` makes of a build: Debian packages and archives of the program, of what others build with that use the
# library, and of the package for Python. scripts/build-packages.sh does it all.
set(QRX_PACKAGE_CONTACT "qrxdeck developers <developers@qrxdeck.invalid>" CACHE STRING
    "Who answers for the packages: name <address>")
include(${CMAKE_CURRENT_LIST_DIR}/QrxDocuments.cmake)
include(${CMAKE_CURRENT_LIST_DIR}/QrxSbom.cmake)

set(CPACK_COMPONENTS_ALL program development)
qrx_documents(program qrxdeck)
qrx_sbom(program qrxdeck "The program, and the library within it" ${QRX_PARTS_OF_PROGRAM})
qrx_notices(program qrxdeck ${QRX_PARTS_OF_PROGRAM})
qrx_documents(development libqrxptinputfilewriter-dev)
qrx_sbom(development libqrxptinputfilewriter-dev "The library" ${QRX_PARTS_OF_LIBRARY})
if(TARGET qrx_python)
    list(APPEND CPACK_COMPONENTS_ALL python)
    qrx_documents(python python3-qrx)
    qrx_sbom(python python3-qrx "The package for Python, and program and library within it" ${QRX_PARTS_OF_PYTHON})
    qrx_notices(python python3-qrx ${QRX_PARTS_OF_PYTHON})
endif()

set(CPACK_PACKAGE_NAME qrxdeck)
set(CPACK_PACKAGE_VENDOR "qrxdeck developers")
set(CPACK_PACKAGE_CONTACT "${QRX_PACKAGE_CONTACT}")
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_STRIP_FILES ON)
set(CPACK_THREADS 1)
# Modes must not depend on who builds, and times not on when.
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_PROJECT_CONFIG_FILE ${CMAKE_CURRENT_LIST_DIR}/CPackByGenerator.cmake)
set(CPACK_PRE_BUILD_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/CPackOneTime.cmake)
set(CPACK_POST_BUILD_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/CPackNoScripts.cmake)
set(CPACK_QRX_TIME "${QRX_SOURCE_TIME}")
if(WIN32)
    set(CPACK_GENERATOR ZIP)
    set(CPACK_PACKAGE_FILE_NAME qrxdeck-${PROJECT_VERSION}-windows-x86_64)
else()
    set(CPACK_GENERATOR DEB TGZ)
    string(TOLOWER ${CMAKE_SYSTEM_NAME} qrx_system)
    set(CPACK_PACKAGE_FILE_NAME qrxdeck-${PROJECT_VERSION}-${qrx_system}-${CMAKE_SYSTEM_PROCESSOR})
endif()

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")

set(CPACK_DEBIAN_PROGRAM_PACKAGE_NAME qrxdeck)
set(CPACK_DEBIAN_PROGRAM_PACKAGE_SECTION science)
set(CPACK_DEBIAN_PROGRAM_DESCRIPTION "finite-element models as keyword decks
qrxdeck reads a finite-element model from a JSON file, with meshes of any
mesher, tells what is wrong with it, and writes the solver's input, a keyword
deck. It also checks, compares and flattens decks, writes decks for the rows
of a table of parameters, and shows a model as a page.")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libqrxptinputfilewriter-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_RECOMMENDS "g++")
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_CONTROL_EXTRA ${CMAKE_CURRENT_LIST_DIR}/development/triggers)
set(CPACK_DEBIAN_DEVELOPMENT_DESCRIPTION "library that writes finite-element models as keyword decks
A program fills a store with a finite-element model; the library checks it
and writes its keyword deck. These are its headers, the library to be linked
statically or dynamically, and what CMake and pkg-config find it by. It needs
nothing but the standard library of C++20.")
if(NOT WIN32)
    # Headers and both libraries go together: what is compiled for one minor version takes no other.
    install(FILES ${CMAKE_CURRENT_LIST_DIR}/development/lintian-overrides RENAME libqrxptinputfilewriter-dev
        DESTINATION ${CMAKE_INSTALL_DATADIR}/lintian/overrides COMPONENT development)
endif()

set(CPACK_DEBIAN_PYTHON_PACKAGE_NAME python3-qrx)
set(CPACK_DEBIAN_PYTHON_PACKAGE_SECTION python)
if(TARGET qrx_python)
    execute_process(COMMAND ${Python_EXECUTABLE} -c
        "import sys; a, b = sys.version_info[:2]; print(f'python3 (>= {a}.{b}~), python3 (<< {a}.{b + 1})')"
        OUTPUT_VARIABLE CPACK_DEBIAN_PYTHON_PACKAGE_DEPENDS OUTPUT_STRIP_TRAILING_WHITESPACE
        COMMAND_ERROR_IS_FATAL ANY)
    set(CPACK_DEBIAN_PYTHON_PACKAGE_RECOMMENDS python3-numpy)
endif()
set(CPACK_DEBIAN_PYTHON_PACKAGE_CONTROL_EXTRA
    ${CMAKE_CURRENT_LIST_DIR}/python3-qrx/postinst ${CMAKE_CURRENT_LIST_DIR}/python3-qrx/prerm)
set(CPACK_DEBIAN_PYTHON_DESCRIPTION "finite-element models as keyword decks, from Python
The module qrx makes finite-element models of arrays, of meshers' files or of
model files, checks them, and writes the keyword decks that a solver reads.")

include(CPack)
