#include "store_interface/findings/fnd_Finding.h"

#include "foundation/nex_Exception.h"

void fnd_AppendPointer(std::string& pointer, std::string_view token) {
    pointer += '/';
    for (const char c : token) {
        if (c == '~') {
            pointer += "~0";
        } else if (c == '/') {
            pointer += "~1";
        } else {
            pointer += c;
        }
    }
}

bool fnd_IsBelow(std::string_view place, std::string_view pointer) {
    if (!place.starts_with(pointer)) return false;
    return pointer.empty() || place.size() == pointer.size() || place[pointer.size()] == '/';
}

std::string fnd_Path::Text() const {
    if (parent_ == nullptr) return {};
    std::string text = parent_->Text();
    fnd_AppendPointer(text, isIndex_ ? std::to_string(index_) : token_);
    return text;
}

std::string fnd_Finding::Text() const {
    // A long list is for whom the hint doesn't help.
    constexpr std::size_t kLong = 80;
    std::string text = found;
    if (!hint.empty() && expected.size() > kLong && expected.find("one of ") != std::string::npos) {
        text.append("; ").append(hint).append(hint.ends_with('?') ? " Expected " : "; expected ");
        return text.append(expected);
    }
    if (!expected.empty()) text.append(", expected ").append(expected);
    if (!hint.empty()) text.append("; ").append(hint);
    return text;
}

const char* fnd_SeverityWord(fnd_Severity severity) {
    switch (severity) {
    case fnd_Severity::ERROR: return "error";
    case fnd_Severity::WARNING: return "warning";
    default: return "note";
    }
}

void fnd_Raise::Take(fnd_Finding finding) {
    if (!finding.IsError()) return;
    const std::string text = finding.place.empty() ? finding.Text() : finding.place + ": " + finding.Text();
    nex_Raise(atr_String(std::string_view(text)));
}

void fnd_Below::Take(fnd_Finding finding) {
    finding.place.insert(0, path_.Text());
    sink_.Take(std::move(finding));
}
