# Packs manual pages of Debian's packages, as Debian wants them; an archive's contents are listed before this. Then all
# that is in a package gets one time, that of the sources, so that the same sources make the same package.
set(time "$ENV{SOURCE_DATE_EPOCH}")
if(NOT time)
    set(time "${CPACK_QRX_TIME}")
endif()
if(CPACK_GENERATOR STREQUAL "DEB")
    file(GLOB_RECURSE manuals ${CPACK_TEMPORARY_DIRECTORY}/*.1)
    list(FILTER manuals INCLUDE REGEX "/man/man1/[^/]*$")
    if(manuals)
        execute_process(COMMAND gzip -9n ${manuals} COMMAND_ERROR_IS_FATAL ANY)
    endif()
endif()
if(time)
    execute_process(COMMAND find ${CPACK_TEMPORARY_DIRECTORY} -exec touch --no-dereference --date=@${time} {} +
        COMMAND_ERROR_IS_FATAL ANY)
    set(ENV{SOURCE_DATE_EPOCH} ${time})
endif()
