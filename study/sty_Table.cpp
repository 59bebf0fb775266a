#include "study/sty_Table.h"

#include "foundation/num_ReadReal.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Pointer.h"
#include "model_file/mdf_Utf8.h"
#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Text.h"
#include "study/sty_Json.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <filesystem>
#include <functional>

namespace {

constexpr std::size_t kMostRowBytes = std::size_t{16} << 20;
constexpr std::size_t kMostNameBytes = 200;

bool IsUtf8(std::string_view text) {
    while (!text.empty()) {
        const std::size_t length = static_cast<signed char>(text.front()) >= 0 ? 1 : mdf_Utf8Length(text);
        if (length == 0) return false;
        text.remove_prefix(length);
    }
    return true;
}

bool IsBlank(std::string_view text) {
    return text.find_first_not_of(" \r") == std::string_view::npos;
}

std::string_view WithoutBlanks(std::string_view text) {
    const std::size_t begin = text.find_first_not_of(" \t\r\n");
    if (begin == std::string_view::npos) return {};
    return text.substr(begin, text.find_last_not_of(" \t\r\n") - begin + 1);
}

/// Whether the text is a JSON number; `whole` tells that it has no fraction and no exponent.
bool IsJsonNumber(std::string_view text, bool& whole) {
    std::size_t at = 0;
    const auto digits = [&] {
        const std::size_t begin = at;
        while (at < text.size() && text[at] >= '0' && text[at] <= '9') ++at;
        return at > begin;
    };
    if (at < text.size() && text[at] == '-') ++at;
    const std::size_t first = at;
    if (!digits() || (text[first] == '0' && at > first + 1)) return false;
    whole = at == text.size();
    if (at < text.size() && text[at] == '.') {
        ++at;
        if (!digits()) return false;
    }
    if (at < text.size() && (text[at] == 'e' || text[at] == 'E')) {
        ++at;
        if (at < text.size() && (text[at] == '+' || text[at] == '-')) ++at;
        if (!digits()) return false;
    }
    return at == text.size();
}

/// The commonest cells need no parser.
bool ReadNumber(std::string_view text, mdf_Value& value) {
    bool whole = false;
    if (!IsJsonNumber(text, whole)) return false;
    const char* const end = text.data() + text.size();
    if (whole) {
        int number = 0;
        if (std::from_chars(text.data(), end, number).ec != std::errc()) return false;
        value = mdf_Value(number);
        return true;
    }
    double number = 0.0;
    if (num_ReadReal(text.data(), end, number).ec != std::errc()) return false;
    value = mdf_Value(number);
    return true;
}

bool LooksLikeJson(std::string_view text) {
    const char first = text.front();
    return first == '"' || first == '[' || first == '{' || first == '-' || (first >= '0' && first <= '9') ||
           text == "true" || text == "false" || text == "null";
}

/// Splits a record; false where text stands behind a closing quote.
bool SplitRecord(std::string_view text, char separator, std::vector<std::string>& fields) {
    fields.clear();
    std::size_t at = 0;
    for (;;) {
        std::string& field = fields.emplace_back();
        if (at < text.size() && text[at] == '"') {
            for (++at;; ++at) {
                if (at >= text.size()) return false;
                if (text[at] != '"') {
                    field += text[at];
                } else if (at + 1 < text.size() && text[at + 1] == '"') {
                    field += text[at++];
                } else {
                    break;
                }
            }
            ++at;
            if (at < text.size() && text[at] != separator) return false;
        } else {
            const std::size_t end = std::min(text.find(separator, at), text.size());
            field.assign(text.substr(at, end - at));
            at = end;
        }
        if (at >= text.size()) return true;
        ++at;
    }
}

/// Why no deck can have the name; empty when one can.
std::string ProblemOfDeckName(std::string_view name) {
    if (name.empty()) return "found no name";
    const auto found = "found the name " + fnd_Quoted(name);
    if (name.find_first_of("/\\") != std::string_view::npos) return found + ", expected one without slashes";
    if (name.front() == '.') return found + ", expected one that doesn't begin with a dot";
    if (name.size() > kMostNameBytes)
        return found + ", expected at most " + std::to_string(kMostNameBytes) + " bytes";
    const auto isBad = [](char c) { return static_cast<unsigned char>(c) < 0x20 || c == 0x7f || c == '"'; };
    if (std::ranges::any_of(name, isBad))
        return found + ", expected one without quotes and control characters";
    return {};
}

} // namespace

sty_Table::Kind sty_Table::KindOf(const std::string& path) {
    const std::string ending = fnd_LowerCase(plt_Path(path).extension().string());
    if (ending == ".csv") return Kind::CSV;
    if (ending == ".tsv" || ending == ".tab") return Kind::TSV;
    if (ending == ".jsonl" || ending == ".ndjson") return Kind::JSON_LINES;
    throw sty_TableError("found a table that ends in " + fnd_Quoted(ending) +
                         ", expected .csv, .tsv or .jsonl");
}

int sty_Table::AddColumn(const std::string& name) {
    const auto [place, isNew] = places_.emplace(name, static_cast<int>(columns_.size()));
    if (isNew) columns_.push_back(name);
    if (columns_.size() > kMostColumns) {
        throw sty_TableError("found more than " + std::to_string(kMostColumns) + " columns");
    }
    return place->second;
}

sty_Table::sty_Table(const std::string& path) : path_(path), kind_(KindOf(path)) {
    sty_Sha256 sum;
    sty_TableReader reader(path, HasHeader(), Separator(), &sum);
    sty_RawRow raw;
    if (HasHeader()) {
        if (!reader.NextRecord(raw)) throw sty_TableError("the table is empty, expected a header and rows");
        TakeHeader(raw);
    }
    std::vector<std::size_t> names;
    while (reader.NextRecord(raw)) {
        ++rows_;
        if (!HasHeader()) {
            mdf_Value value;
            std::vector<fnd_Finding> errors;
            if (mdf_Parse(raw.text, value, errors) && value.IsObject()) {
                for (const mdf_Member& member : value.Members()) AddColumn(member.name);
            }
            hasNames_ = places_.contains(kNameColumn);
        }
        if (hasNames_) names.push_back(std::hash<std::string>()(Parse(raw).name));
    }
    if (rows_ == 0) throw sty_TableError("the table has no rows");
    sha256_ = sum.Hex();
    CheckNames(names);
}

void sty_Table::TakeHeader(const sty_RawRow& raw) {
    if (!IsUtf8(raw.text)) throw sty_TableError("the header isn't UTF-8");
    const auto separators = std::ranges::count(raw.text, Separator());
    if (static_cast<std::size_t>(separators) >= kMostColumns) {
        throw sty_TableError("found " + std::to_string(separators + 1) + " columns, expected at most " +
                             std::to_string(kMostColumns));
    }
    std::vector<std::string> names;
    if (!SplitRecord(raw.text, Separator(), names))
        throw sty_TableError("line 1: found text behind a quoted name, expected a separator");
    if (names.size() == 1 && kind_ == Kind::CSV && names.front().find(';') != std::string::npos) {
        throw sty_TableError("found the header " + fnd_Quoted(names.front()) +
                             ", expected commas between its columns");
    }
    for (std::size_t i = 0; i < names.size(); ++i) {
        const std::string name(WithoutBlanks(names[i]));
        if (name.empty()) throw sty_TableError("column " + std::to_string(i + 1) + " has no name");
        if (places_.contains(name)) {
            throw sty_TableError("found a second column " + fnd_Quoted(name) +
                                 ", expected names that are unique");
        }
        AddColumn(name);
    }
    hasNames_ = places_.contains(kNameColumn);
}

void sty_Table::CheckNames(std::vector<std::size_t>& hashes) const {
    std::ranges::sort(hashes);
    const auto twice = std::ranges::adjacent_find(hashes);
    if (twice == hashes.end()) return;
    // Equal sums are equal names but for one case in billions, so this walk is hardly ever for nothing.
    std::map<std::string, long long> first;
    sty_TableReader reader(*this);
    sty_RawRow raw;
    while (reader.Next(raw)) {
        const sty_Row row = Parse(raw);
        const std::size_t sum = std::hash<std::string>()(row.name);
        const auto [low, high] = std::equal_range(hashes.begin(), hashes.end(), sum);
        if (row.name.empty() || high - low < 2) continue;
        const auto [place, isNew] = first.emplace(row.name, raw.number);
        if (!isNew) {
            throw sty_TableError("rows " + std::to_string(place->second) + " and " +
                                 std::to_string(raw.number) + " have the name " + fnd_Quoted(row.name) +
                                 ", expected names that are unique");
        }
    }
}

sty_Row sty_Table::Parse(const sty_RawRow& raw) const {
    sty_Row row;
    row.number = raw.number;
    if (!IsUtf8(raw.text)) {
        row.problem = "found text that isn't UTF-8";
    } else if (kind_ == Kind::JSON_LINES) {
        ParseObject(raw, row);
    } else {
        ParseCells(raw, row);
    }
    return row;
}

void sty_Table::NameRow(sty_Row& row, const std::string& name) const {
    std::string problem = ProblemOfDeckName(name);
    if (problem.empty()) {
        row.name = name;
    } else if (row.problem.empty()) {
        row.problem = std::move(problem);
        row.problemColumn = kNameColumn;
    }
}

void sty_Table::ParseCells(const sty_RawRow& raw, sty_Row& row) const {
    std::vector<std::string> fields;
    if (!SplitRecord(raw.text, Separator(), fields)) {
        row.problem = "found text behind a quoted cell, expected a separator";
        return;
    }
    if (fields.size() != columns_.size()) {
        row.problem = "found " + fnd_Counted(static_cast<long long>(fields.size()), "cell") + ", expected " +
                      std::to_string(columns_.size());
        return;
    }
    for (std::size_t i = 0; i < fields.size(); ++i) {
        if (columns_[i] == kNameColumn) {
            NameRow(row, fields[i]);
            continue;
        }
        const std::string_view text = WithoutBlanks(fields[i]);
        sty_Cell cell;
        cell.column = static_cast<int>(i);
        if (text.empty()) {
            if (!row.problem.empty()) continue;
            row.problem = "found an empty cell, expected a JSON value (an empty text is \"\"\"\"\"\")";
            row.problemColumn = columns_[i];
            continue;
        }
        std::vector<fnd_Finding> errors;
        if (ReadNumber(text, cell.value)) {
            cell.json = text;
        } else if (LooksLikeJson(text) && mdf_Parse(text, cell.value, errors)) {
            cell.json = mdf_JsonText(cell.value);
        } else {
            cell.value = mdf_Value(text);
            cell.json = sty_Quoted(text);
        }
        row.cells.push_back(std::move(cell));
    }
}

void sty_Table::ParseObject(const sty_RawRow& raw, sty_Row& row) const {
    mdf_Value object;
    std::vector<fnd_Finding> errors;
    if (!mdf_Parse(raw.text, object, errors)) {
        row.problem = errors.front().Text();
        if (errors.front().column > 0)
            row.problem += " (column " + std::to_string(errors.front().column) + ")";
        return;
    }
    if (!object.IsObject()) {
        row.problem = "found a line that is no object, expected a JSON object a line";
        return;
    }
    for (const mdf_Member& member : object.Members()) TakeMember(member, row);
    if (hasNames_ && object.Find(kNameColumn) == nullptr && row.problem.empty())
        row.problem = "found no name, although other rows have one";
}

void sty_Table::TakeMember(const mdf_Member& member, sty_Row& row) const {
    if (member.name == kNameColumn) {
        const mdf_Value& value = member.value;
        if (value.IsString() || value.IsInt()) {
            NameRow(row, value.IsInt() ? std::to_string(value.Int()) : value.String());
        } else if (row.problem.empty()) {
            row.problem = "found " + std::string(value.KindText()) + ", expected a name";
            row.problemColumn = kNameColumn;
        }
        return;
    }
    const auto place = places_.find(member.name);
    // A file that changed since it was looked at.
    if (place == places_.end()) {
        row.problem = "found a column that wasn't there before";
        row.problemColumn = member.name;
        return;
    }
    row.cells.push_back({place->second, member.value, mdf_JsonText(member.value)});
}

sty_TableReader::sty_TableReader(const std::string& path, bool quotes, char separator, sty_Sha256* sum)
    : path_(path), file_(path), quotes_(quotes), separator_(separator), sum_(sum) {}

sty_TableReader::sty_TableReader(const sty_Table& table)
    : sty_TableReader(table.path_, table.HasHeader(), table.Separator(), nullptr) {
    sty_RawRow header;
    if (table.HasHeader()) NextRecord(header);
    number_ = 0;
}

bool sty_TableReader::Next(sty_RawRow& row) {
    return NextRecord(row);
}

bool sty_TableReader::Fill() {
    if (!piece_.empty()) return true;
    piece_ = file_.Next();
    if (file_.Error() != 0)
        throw sty_TableError("the table can't be read: " + sty_ReasonOf(file_.Error()), true);
    if (sum_ != nullptr) sum_->Add(piece_);
    if (atBegin_ && piece_.starts_with("\xEF\xBB\xBF")) piece_.remove_prefix(3);
    atBegin_ = false;
    return !piece_.empty();
}

bool sty_TableReader::NextRecord(sty_RawRow& row) {
    for (;;) {
        row.text.clear();
        row.line = line_;
        bool inQuotes = false;
        bool atFieldBegin = true;
        bool ended = false;
        while (!ended && Fill()) {
            std::size_t at = 0;
            for (; at < piece_.size(); ++at) {
                const char c = piece_[at];
                if (c == '\n') {
                    ++line_;
                    if (!inQuotes) break;
                } else if (quotes_ && c == '"' && (inQuotes || atFieldBegin)) {
                    // A doubled quote within a cell closes it and opens it again.
                    inQuotes = !inQuotes;
                    atFieldBegin = !inQuotes;
                    continue;
                }
                atFieldBegin = c == separator_;
            }
            ended = at < piece_.size();
            row.text.append(piece_.substr(0, at));
            piece_.remove_prefix(ended ? at + 1 : at);
            if (row.text.size() > kMostRowBytes) {
                throw sty_TableError("line " + std::to_string(row.line) +
                                     ": found a row of more than 16 MiB; is a quote not closed?");
            }
        }
        if (!ended && inQuotes) {
            throw sty_TableError("line " + std::to_string(row.line) +
                                 ": found a quote that is opened and not closed");
        }
        if (row.text.ends_with('\r')) row.text.pop_back();
        if (!IsBlank(row.text)) {
            row.number = ++number_;
            return true;
        }
        if (!ended) return false;
    }
}
