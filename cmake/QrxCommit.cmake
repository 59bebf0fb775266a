# The commit that the sources are of, and its time: of a clone, or as an archive of the sources has it written below.
set(qrx_archived_commit "$Format:%H$")
set(qrx_archived_time "$Format:%ct$")

# qrx_find_commit(COMMIT TIME FOLDER): twelve digits, with "+" behind them when sources were changed since, and seconds
# since 1970; both empty where nobody knows.
function(qrx_find_commit commit time folder)
    set(found)
    set(found_time)
    if(qrx_archived_commit MATCHES "^([0-9a-f]+)$")
        string(SUBSTRING "${qrx_archived_commit}" 0 12 found)
        set(found_time "${qrx_archived_time}")
    elseif(EXISTS ${folder}/.git)
        execute_process(COMMAND git -C ${folder} describe --always --exclude=* --abbrev=12 --dirty=+
            OUTPUT_VARIABLE found OUTPUT_STRIP_TRAILING_WHITESPACE ERROR_QUIET)
        execute_process(COMMAND git -C ${folder} log -1 --format=%ct
            OUTPUT_VARIABLE found_time OUTPUT_STRIP_TRAILING_WHITESPACE ERROR_QUIET)
    endif()
    set(${commit} "${found}" PARENT_SCOPE)
    set(${time} "${found_time}" PARENT_SCOPE)
endfunction()
