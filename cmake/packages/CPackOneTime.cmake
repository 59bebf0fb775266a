# Gives all that is packed one time, that of the sources, so that the same sources make the same package.
set(time "$ENV{SOURCE_DATE_EPOCH}")
if(NOT time)
    set(time "${CPACK_QRX_TIME}")
endif()
if(time AND NOT CMAKE_HOST_WIN32)
    execute_process(COMMAND find ${CPACK_TEMPORARY_DIRECTORY} -exec touch --no-dereference --date=@${time} {} +
        COMMAND_ERROR_IS_FATAL ANY)
    set(ENV{SOURCE_DATE_EPOCH} ${time})
endif()
