#include "tools/StandardStreams.h"

#include "platform/plt_Process.h"
#include "whole_file/whf_WriteAll.h"

void SecureStandardStreams() noexcept {
    plt_SecureStandardStreams();
}

bool CanWriteToStandardOutput() noexcept {
    return plt_CanWriteToStandardOutput();
}

int WriteToStandardOutput(std::string_view text) noexcept {
    return whf_WriteAll(plt_kStandardOutput, text);
}

int WriteToStandardError(std::string_view text) noexcept {
    return whf_WriteAll(plt_kStandardError, text);
}
