#include "model_file/mdf_Pointer.h"

#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Writer.h"

#include <charconv>
#include <sstream>
#include <stdexcept>

namespace {

/// The index that a token of an array is; nothing for any other text.
std::optional<std::size_t> IndexOf(std::string_view token) {
    if (token.empty() || (token.size() > 1 && token.front() == '0')) return std::nullopt;
    std::size_t index = 0;
    const auto [end, error] = std::from_chars(token.data(), token.data() + token.size(), index);
    if (error != std::errc() || end != token.data() + token.size()) return std::nullopt;
    return index;
}

[[noreturn]] void RaiseNoPlace() {
    throw std::logic_error("a value was put where there is none");
}

/// Which form an array has depends on its items, so one whose items were changed is read anew.
void MakeCompact(mdf_Value& array) {
    mdf_Value compact;
    std::vector<fnd_Finding> errors;
    mdf_Parse(mdf_JsonText(array), compact, errors);
    array = std::move(compact);
}

void Put(mdf_Value& at, std::span<const std::string> tokens, const mdf_Value& value, bool insideArray) {
    if (tokens.empty()) {
        at = value;
        return;
    }
    if (at.IsObject()) {
        mdf_Value* member = at.Find(tokens.front());
        if (member == nullptr) RaiseNoPlace();
        Put(*member, tokens.subspan(1), value, insideArray);
        return;
    }
    const std::optional<std::size_t> index = IndexOf(tokens.front());
    if (!at.IsArray() || !index || *index >= at.Size()) RaiseNoPlace();
    at.Generalise();
    Put(at.Items()[*index], tokens.subspan(1), value, true);
    if (!insideArray) MakeCompact(at);
}

} // namespace

std::optional<std::vector<std::string>> mdf_PointerTokens(std::string_view pointer) {
    std::vector<std::string> tokens;
    if (pointer.empty()) return tokens;
    if (pointer.front() != '/') return std::nullopt;
    for (std::size_t i = 0; i < pointer.size(); ++i) {
        if (pointer[i] == '/') {
            tokens.emplace_back();
        } else if (pointer[i] != '~') {
            tokens.back() += pointer[i];
        } else if (++i < pointer.size() && (pointer[i] == '0' || pointer[i] == '1')) {
            tokens.back() += pointer[i] == '0' ? '~' : '/';
        } else {
            return std::nullopt;
        }
    }
    return tokens;
}

int mdf_FirstWrongToken(const mdf_Value& root, std::span<const std::string> tokens,
                        std::vector<std::string>* names) {
    const mdf_Value* at = &root;
    mdf_Value item;
    for (std::size_t i = 0; i < tokens.size(); ++i) {
        if (at->IsObject()) {
            const mdf_Value* member = at->Find(tokens[i]);
            if (member == nullptr) {
                if (names != nullptr) {
                    for (const mdf_Member& other : at->Members()) names->push_back(other.name);
                }
                return static_cast<int>(i);
            }
            at = member;
            continue;
        }
        const std::optional<std::size_t> index = IndexOf(tokens[i]);
        if (!at->IsArray() || !index || *index >= at->Size()) return static_cast<int>(i);
        if (at->Kind() == mdf_Kind::Array) {
            at = &at->Items()[*index];
        } else {
            mdf_Value next = at->Item(*index);
            item = std::move(next);
            at = &item;
        }
    }
    return -1;
}

bool mdf_HasPlace(const mdf_Value& root, std::span<const std::string> tokens) {
    return mdf_FirstWrongToken(root, tokens) < 0;
}

void mdf_PutAt(mdf_Value& root, std::span<const std::string> tokens, const mdf_Value& value) {
    Put(root, tokens, value, false);
}

std::string mdf_JsonText(const mdf_Value& value) {
    std::ostringstream text;
    mdf_Writer out(text);
    out.BeginArray(mdf_Layout::OneLine);
    out.Value(value);
    out.EndArray();
    out.Finish();
    // Within a line of its own everything stays on it; the brackets and the newline are not the value's.
    std::string line = std::move(text).str();
    return line.substr(1, line.size() - 3);
}
