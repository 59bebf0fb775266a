# What of others is in the packages: written down as an SPDX document of each, and its notices beside it.

# qrx_part(KEY NAME LICENSE RELATION HOME [VERSION ...] [PACKAGE ...] [NOTICE ...]): a library that something is made
# with. RELATION is SPDX's: CONTAINS for what is compiled in, else STATIC_LINK or DYNAMIC_LINK. Where it comes from a
# Debian package, that has the version and the notice.
function(qrx_part key name license relation home)
    cmake_parse_arguments(ARG "" "VERSION;PACKAGE;NOTICE" "" ${ARGN})
    set(version "${ARG_VERSION}")
    set(notice "${ARG_NOTICE}")
    set(purl)
    if(ARG_PACKAGE)
        execute_process(COMMAND dpkg-query -W -f "\${Version}" ${ARG_PACKAGE}
            OUTPUT_VARIABLE found ERROR_QUIET RESULT_VARIABLE failed)
        if(failed EQUAL 0 AND found)
            set(version "${found}")
            string(REPLACE "+" "%2B" purl "pkg:deb/debian/${ARG_PACKAGE}@${found}")
            string(REPLACE ":" "%3A" purl "${purl}")
            string(REPLACE "pkg%3A" "pkg:" purl "${purl}")
        endif()
        if(EXISTS /usr/share/doc/${ARG_PACKAGE}/copyright)
            set(notice /usr/share/doc/${ARG_PACKAGE}/copyright)
        endif()
    endif()
    if(NOT version)
        set(version NOASSERTION)
    endif()
    foreach(what name license relation home version purl notice)
        set(qrx_part_${key}_${what} "${${what}}" PARENT_SCOPE)
    endforeach()
    set(qrx_part_${key}_package "${ARG_PACKAGE}" PARENT_SCOPE)
endfunction()

if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU" AND NOT WIN32)
    qrx_part(standard libstdc++ "GPL-3.0-or-later WITH GCC-exception-3.1" DYNAMIC_LINK https://gcc.gnu.org
        VERSION ${CMAKE_CXX_COMPILER_VERSION} PACKAGE libstdc++6)
elseif(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
    qrx_part(standard libstdc++ "GPL-3.0-or-later WITH GCC-exception-3.1" STATIC_LINK https://gcc.gnu.org
        VERSION ${CMAKE_CXX_COMPILER_VERSION})
else()
    qrx_part(standard "C++ standard library" NOASSERTION DYNAMIC_LINK NOASSERTION)
endif()
set(QRX_PARTS_OF_LIBRARY standard)

if(TARGET qrxdeck)
    qrx_part(json nlohmann-json MIT CONTAINS https://github.com/nlohmann/json
        VERSION ${nlohmann_json_VERSION} PACKAGE nlohmann-json3-dev)
    qrx_part(cli CLI11 BSD-3-Clause CONTAINS https://github.com/CLIUtils/CLI11
        VERSION ${CLI11_VERSION} PACKAGE libcli11-dev)
    set(QRX_PARTS_OF_PROGRAM standard json cli)
    if(WIN32)
        qrx_part(runtime mingw-w64 "ZPL-2.1" STATIC_LINK https://www.mingw-w64.org PACKAGE mingw-w64-x86-64-dev)
        list(APPEND QRX_PARTS_OF_PROGRAM runtime)
    else()
        qrx_part(crypto OpenSSL Apache-2.0 DYNAMIC_LINK https://openssl-library.org PACKAGE libssl3)
        list(APPEND QRX_PARTS_OF_PROGRAM crypto)
    endif()
    if(QRX_READS_VTU)
        qrx_part(pugixml pugixml MIT DYNAMIC_LINK https://pugixml.org VERSION ${pugixml_VERSION} PACKAGE libpugixml1v5)
        qrx_part(zlib zlib Zlib DYNAMIC_LINK https://zlib.net PACKAGE zlib1g)
        list(APPEND QRX_PARTS_OF_PROGRAM pugixml zlib)
    endif()
    if(QRX_READS_MED)
        qrx_part(hdf5 HDF5 BSD-3-Clause DYNAMIC_LINK https://www.hdfgroup.org/solutions/hdf5 PACKAGE libhdf5-103-1)
        list(APPEND QRX_PARTS_OF_PROGRAM hdf5)
    endif()
    set(three ${PROJECT_SOURCE_DIR}/viewer/node_modules/three)
    if(QRX_HAS_PAGE AND EXISTS ${three}/package.json)
        file(READ ${three}/package.json described)
        string(JSON three_version GET "${described}" version)
        qrx_part(three three MIT CONTAINS https://threejs.org VERSION ${three_version} NOTICE ${three}/LICENSE)
        set(qrx_part_three_purl pkg:npm/three@${three_version})
        list(APPEND QRX_PARTS_OF_PROGRAM three)
    endif()
endif()
if(TARGET qrx_python)
    qrx_part(pybind pybind11 BSD-3-Clause CONTAINS https://github.com/pybind/pybind11
        VERSION ${pybind11_VERSION} PACKAGE pybind11-dev)
    set(QRX_PARTS_OF_PYTHON ${QRX_PARTS_OF_PROGRAM} pybind)
endif()

# qrx_notices(COMPONENT PACKAGE PARTS...): the terms of what is compiled in, or linked statically.
function(qrx_notices component package)
    foreach(part ${ARGN})
        if(qrx_part_${part}_relation STREQUAL "DYNAMIC_LINK")
            continue()
        endif()
        set(name ${qrx_part_${part}_package})
        if(NOT name)
            set(name ${qrx_part_${part}_name})
        endif()
        if(qrx_part_${part}_notice)
            install(FILES ${qrx_part_${part}_notice} RENAME ${name} COMPONENT ${component}
                DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/${package}/notices)
        elseif(NOT part STREQUAL "standard")
            message(WARNING "No notice of ${name}: an installed ${package} will lack it")
        endif()
    endforeach()
endfunction()

# qrx_sbom(COMPONENT PACKAGE SUMMARY PARTS...): installs the SPDX document of a package.
function(qrx_sbom component package summary)
    qrx_time(created "%Y-%m-%dT%H:%M:%SZ")
    set(version ${PROJECT_VERSION})
    if(QRX_SOURCE_COMMIT)
        string(APPEND version "+${QRX_SOURCE_COMMIT}")
    endif()
    set(packages "    {
      \"SPDXID\": \"SPDXRef-self\",
      \"name\": \"${package}\",
      \"versionInfo\": \"${version}\",
      \"summary\": \"${summary}\",
      \"downloadLocation\": \"NOASSERTION\",
      \"filesAnalyzed\": false,
      \"licenseConcluded\": \"NOASSERTION\",
      \"licenseDeclared\": \"NOASSERTION\",
      \"copyrightText\": \"NOASSERTION\"
    }")
    set(relations "    {\"spdxElementId\": \"SPDXRef-DOCUMENT\", \"relationshipType\": \"DESCRIBES\", \
\"relatedSpdxElement\": \"SPDXRef-self\"}")
    foreach(part ${ARGN})
        set(refs)
        if(qrx_part_${part}_purl)
            set(refs ",\n      \"externalRefs\": [{\"referenceCategory\": \"PACKAGE-MANAGER\", \
\"referenceType\": \"purl\", \"referenceLocator\": \"${qrx_part_${part}_purl}\"}]")
        endif()
        string(APPEND packages ",\n    {
      \"SPDXID\": \"SPDXRef-${part}\",
      \"name\": \"${qrx_part_${part}_name}\",
      \"versionInfo\": \"${qrx_part_${part}_version}\",
      \"downloadLocation\": \"${qrx_part_${part}_home}\",
      \"filesAnalyzed\": false,
      \"licenseConcluded\": \"${qrx_part_${part}_license}\",
      \"licenseDeclared\": \"${qrx_part_${part}_license}\",
      \"copyrightText\": \"NOASSERTION\"${refs}
    }")
        string(APPEND relations ",\n    {\"spdxElementId\": \"SPDXRef-self\", \
\"relationshipType\": \"${qrx_part_${part}_relation}\", \"relatedSpdxElement\": \"SPDXRef-${part}\"}")
    endforeach()
    string(REPLACE "+" "-" unique "${version}")
    set(file ${PROJECT_BINARY_DIR}/packages/${package}/${package}.spdx.json)
    file(CONFIGURE OUTPUT ${file} @ONLY CONTENT "{
  \"spdxVersion\": \"SPDX-2.3\",
  \"dataLicense\": \"CC0-1.0\",
  \"SPDXID\": \"SPDXRef-DOCUMENT\",
  \"name\": \"${package}-${version}\",
  \"documentNamespace\": \"https://spdx.org/spdxdocs/${package}-${unique}\",
  \"creationInfo\": {\"created\": \"${created}\", \"creators\": [\"Tool: CMake-${CMAKE_VERSION}\"]},
  \"packages\": [
${packages}
  ],
  \"relationships\": [
${relations}
  ]
}
")
    install(FILES ${file} DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/${package} COMPONENT ${component})
endfunction()
