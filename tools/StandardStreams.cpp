#include "tools/StandardStreams.h"

#include "platform/plt_Files.h"
#include "platform/plt_Process.h"
#include "whole_file/whf_WriteAll.h"

#include <cerrno>

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

int ReadStandardInput(std::string& text) {
    constexpr std::size_t least = std::size_t{64} * 1024;
    std::size_t length = 0;
    text.resize(least);
    while (true) {
        if (length == text.size()) text.resize(2 * length);
        const ssize_t taken = plt_Read(plt_kStandardInput, text.data() + length, text.size() - length);
        if (taken < 0 && errno == EINTR) continue;
        if (taken <= 0) {
            text.resize(length);
            return taken < 0 ? errno : 0;
        }
        length += static_cast<std::size_t>(taken);
    }
}

int ColumnsOfTerminal(bool ofErrors) noexcept {
    return plt_ColumnsOfTerminal(ofErrors ? plt_kStandardError : plt_kStandardOutput);
}
