#include "tools/OutOfMemory.h"

#include "platform/plt_Process.h"
#include "tools/ProgressLine.h"
#include "tools/RunReport.h"
#include "tools/StandardStreams.h"
#include "whole_file/whf_SignalCleanUp.h"

#include <atomic>
#include <new>

namespace {

bool tellsAsJson = false;
bool isWritten = false;

} // namespace

void OutOfMemory::Install(bool asJson) {
    tellsAsJson = asJson;
    std::set_new_handler(&OutOfMemory::End);
}

void OutOfMemory::MarkWritten(bool written) noexcept {
    isWritten = written;
}

void OutOfMemory::End() noexcept {
    // Of several threads that find none at a time, one tells.
    static std::atomic_flag isEnding;
    while (isEnding.test_and_set()) isEnding.wait(true);
    whf_SignalCleanUp::Remove();
    ProgressLine::Erase();
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
