# cmake -D SOURCE_DIR=... -D VERSION=... -D OUTPUT=... -P WriteVersion.cmake: the source file of ProgramVersion(), left
# alone when it says the same already.
include(${CMAKE_CURRENT_LIST_DIR}/QrxCommit.cmake)
qrx_find_commit(commit time ${SOURCE_DIR})
set(text "qrxdeck ${VERSION}")
if(commit)
    string(APPEND text " (${commit})")
endif()
file(CONFIGURE OUTPUT ${OUTPUT} CONTENT "#include \"tools/Program.h\"

const char* ProgramVersion() noexcept {
    return \"${text}\";
}
" @ONLY)
