# The commit and the time of the sources; SOURCE_DATE_EPOCH goes ahead of the latter.
include(${PROJECT_SOURCE_DIR}/cmake/QrxCommit.cmake)
qrx_find_commit(QRX_SOURCE_COMMIT QRX_SOURCE_TIME ${PROJECT_SOURCE_DIR})
if(DEFINED ENV{SOURCE_DATE_EPOCH})
    set(QRX_SOURCE_TIME $ENV{SOURCE_DATE_EPOCH})
endif()

# qrx_time(TEXT FORMAT): the time of the sources, or now where nobody knows it.
function(qrx_time text format)
    if(QRX_SOURCE_TIME)
        set(ENV{SOURCE_DATE_EPOCH} ${QRX_SOURCE_TIME})
    endif()
    string(TIMESTAMP made "${format}" UTC)
    set(${text} "${made}" PARENT_SCOPE)
endfunction()

# qrx_documents(COMPONENT PACKAGE): what every Debian package says of itself, the terms that it stands under and its
# history.
function(qrx_documents component package)
    set(folder ${PROJECT_BINARY_DIR}/packages/${package})
    qrx_time(date "%a, %d %b %Y %H:%M:%S +0000")
    set(of)
    if(QRX_SOURCE_COMMIT)
        set(of " Commit ${QRX_SOURCE_COMMIT}.")
    endif()
    file(CONFIGURE OUTPUT ${folder}/changelog @ONLY CONTENT
"${package} (${PROJECT_VERSION}) stable; urgency=medium

  * Version ${PROJECT_VERSION}.${of}

 -- ${QRX_PACKAGE_CONTACT}  ${date}
")
    file(CONFIGURE OUTPUT ${folder}/copyright @ONLY CONTENT
"${package}

The licence of this software is not yet chosen. Until it is, all rights are its
authors'.

What of others is compiled in stands under its own terms. The file
${package}.spdx.json lists it, and the folder notices, where there is one, has
the terms.
")
    set(doc ${CMAKE_INSTALL_DATADIR}/doc/${package})
    install(FILES ${folder}/copyright DESTINATION ${doc} COMPONENT ${component})
    find_program(QRX_GZIP gzip)
    if(QRX_GZIP)
        execute_process(COMMAND ${QRX_GZIP} -9nc ${folder}/changelog OUTPUT_FILE ${folder}/changelog.gz
            COMMAND_ERROR_IS_FATAL ANY)
        install(FILES ${folder}/changelog.gz DESTINATION ${doc} COMPONENT ${component})
    endif()
endfunction()
