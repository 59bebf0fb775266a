# Packs manual pages, as Debian wants them. Then all that is in a package gets one time, that of the sources, so that the
# same sources make the same package.
set(time "$ENV{SOURCE_DATE_EPOCH}")
if(NOT time)
    set(time "${CPACK_QRX_TIME}")
endif()
file(GLOB_RECURSE manuals ${CPACK_TEMPORARY_DIRECTORY}/*/man/man1/*.1)
if(manuals)
    execute_process(COMMAND gzip -9n ${manuals} COMMAND_ERROR_IS_FATAL ANY)
endif()
if(time)
    execute_process(COMMAND find ${CPACK_TEMPORARY_DIRECTORY} -exec touch --no-dereference --date=@${time} {} +
        COMMAND_ERROR_IS_FATAL ANY)
    set(ENV{SOURCE_DATE_EPOCH} ${time})
endif()
