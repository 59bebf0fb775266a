#include "tools/OutOfMemory.h"

#include "platform/plt_Process.h"
#include "tools/RunReport.h"
#include "whole_file/whf_SignalCleanUp.h"
#include "tools/StandardStreams.h"

#include <new>

namespace {

bool tellsAsJson = false;
bool isWritten = false;

} // namespace

void OutOfMemory::Install(bool asJson) {
    tellsAsJson = asJson;
    std::set_new_handler(&OutOfMemory::End);
}

void OutOfMemory::MarkWritten() noexcept {
    isWritten = true;
}

void OutOfMemory::End() noexcept {
    whf_SignalCleanUp::Remove();
    const ExitCode code = isWritten ? ExitCode::REPORT_LOST : ExitCode::FILE_SYSTEM_REFUSED;
    if (tellsAsJson && !isWritten) {
        WriteToStandardOutput(
            "{\"exitCode\": 3, \"messages\": [{\"severity\": \"error\", \"code\": \"run-failed\", "
            "\"file\": \"qrxdeck\", \"pointer\": \"\", \"text\": \"not enough memory\", "
            "\"found\": \"not enough memory\"}]}\n");
    } else {
        WriteToStandardError(isWritten ? "qrxdeck: error: not enough memory to report what was written\n"
                                       : "qrxdeck: error: not enough memory\n");
    }
    plt_EndNow(static_cast<int>(code));
}
