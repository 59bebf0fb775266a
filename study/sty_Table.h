#ifndef QRX_STY_TABLE_H
#define QRX_STY_TABLE_H

#include "model_file/mdf_Value.h"
#include "study/sty_File.h"
#include "study/sty_Sha256.h"

#include <exception>
#include <map>
#include <memory>
#include <string>
#include <vector>

/// What a table can't be used for, and whether it was the system that refused it.
class sty_TableError : public std::exception {
public:
    explicit sty_TableError(std::string text, bool unreadable = false)
        : text_(std::move(text)), unreadable_(unreadable) {}
    const char* what() const noexcept override { return text_.c_str(); }
    bool IsUnreadable() const { return unreadable_; }

private:
    std::string text_;
    bool unreadable_;
};

/// A row as it stands in the file.
struct sty_RawRow {
    /// From 1, the header and empty lines not counted.
    long long number = 0;
    /// The line that it begins in.
    long line = 0;
    std::string text;
};

struct sty_Cell {
    /// Its place among the table's columns.
    int column = 0;
    mdf_Value value;
    /// The value as JSON text.
    std::string json;
};

struct sty_Row {
    long long number = 0;
    /// Of the deck; empty where the table has no names.
    std::string name;
    std::vector<sty_Cell> cells;
    /// What is wrong, and of which column; empty for none.
    std::string problem;
    std::string problemColumn;
};

/// A table of parameters: CSV and TSV with a header (quotes may enclose a cell, and are doubled within one),
/// or a JSON object a line. A cell is a JSON scalar or array; a text that is no JSON is a string. The column
/// "name" is a text as it stands.
///
/// The file is read twice: first as a whole, for what can be wrong with all of it, then row by row.
class sty_Table {
public:
    static constexpr std::size_t kMostColumns = 10'000;
    static constexpr const char* kNameColumn = "name";

    /// Raises sty_TableError.
    explicit sty_Table(const std::string& path);

    const std::string& Path() const { return path_; }
    /// All columns; of JSON lines the members of any row, in the order in which they come.
    const std::vector<std::string>& Columns() const { return columns_; }
    long long Rows() const { return rows_; }
    bool HasNames() const { return hasNames_; }
    /// Every row has all columns.
    bool HasHeader() const { return kind_ != Kind::JSON_LINES; }
    const std::string& Sha256() const { return sha256_; }

    /// What the row says. May be asked by several threads at once.
    sty_Row Parse(const sty_RawRow& raw) const;

private:
    friend class sty_TableReader;
    enum class Kind { CSV, TSV, JSON_LINES };

    static Kind KindOf(const std::string& path);
    char Separator() const { return kind_ == Kind::TSV ? '\t' : ','; }
    void TakeHeader(const sty_RawRow& raw);
    void CheckNames(std::vector<std::size_t>& hashes) const;
    void ParseCells(const sty_RawRow& raw, sty_Row& row) const;
    void ParseObject(const sty_RawRow& raw, sty_Row& row) const;
    void TakeMember(const mdf_Member& member, sty_Row& row) const;
    void NameRow(sty_Row& row, const std::string& name) const;
    int AddColumn(const std::string& name);

    std::string path_;
    Kind kind_;
    std::vector<std::string> columns_;
    std::map<std::string, int, std::less<>> places_;
    long long rows_ = 0;
    bool hasNames_ = false;
    std::string sha256_;
};

/// Gives the rows of a table one after the other.
class sty_TableReader {
public:
    explicit sty_TableReader(const sty_Table& table);
    bool Next(sty_RawRow& row);

private:
    friend class sty_Table;
    /// Reads records, a header among them; sums up the bytes where a sum is given.
    sty_TableReader(const std::string& path, bool quotes, char separator, sty_Sha256* sum);
    bool NextRecord(sty_RawRow& row);
    bool Fill();

    std::string path_;
    sty_File file_;
    bool quotes_;
    char separator_;
    sty_Sha256* sum_;
    std::string_view piece_;
    bool atBegin_ = true;
    long line_ = 1;
    long long number_ = 0;
};

#endif
