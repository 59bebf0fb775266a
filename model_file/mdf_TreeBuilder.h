#ifndef QRX_MODEL_FILE_MDF_TREEBUILDER_H
#define QRX_MODEL_FILE_MDF_TREEBUILDER_H

#include "model_file/mdf_Number.h"
#include "model_file/mdf_ValueData.h"

#include <string>
#include <string_view>
#include <vector>

/// Makes the tree of a document from its tokens, in their order.
class mdf_Builder {
public:
    explicit mdf_Builder(mdf_Value& root) : root_(root) {}

    void Null() { Other(mdf_Value()); }
    void Bool(bool value) { Other(mdf_Value(value)); }
    /// A good one.
    void Number(const mdf_Number& number);
    void String(std::string_view text);
    void BeginObject();
    void Key(std::string_view name);
    /// Of members with one name the first stays; the names of the others are returned, and the object's
    /// pointer with them.
    std::vector<std::string> EndObject(std::string& pointer);
    void BeginArray();
    void EndArray();

    /// How many arrays and objects are open.
    std::size_t Depth() const { return frames_.size() + (rowOpen_ ? 1 : 0); }
    /// Whether the innermost open one is an object.
    bool IsInObject() const { return !rowOpen_ && frames_.back().IsObject(); }
    /// Whether the innermost open one is a row of an array of rows.
    bool IsInRow() const { return rowOpen_; }

    /// The numbers of the row or array that is open; null when it holds other things.
    mdf_Numbers* OpenNumbers();
    /// The rows of the array that is open, where no row is; null when it holds other things.
    mdf_Rows* OpenRows();
    /// A row begins whose numbers the caller adds to OpenRows(). It ends with CloseRow() of these, as long as
    /// nothing else is told of meanwhile.
    void BeginRow(const mdf_Rows& rows) {
        rowOpen_ = true;
        rowBegin_ = rows.numbers.Size();
    }
    void ForgetRow() { rowOpen_ = false; }

private:
    void Int(int value);
    void Real(double value, bool isLarge);
    void Other(mdf_Value value);
    void Place(mdf_Value value);
    bool AddFacetName(std::string_view text);
    void DemoteRow();
    std::string PointerOfNext() const;
    mdf_Value& Top() { return frames_.back(); }

    mdf_Value& root_;
    /// The arrays and objects that are open, outermost first; the last member of an open object is the one
    /// whose value is being read.
    std::vector<mdf_Value> frames_;
    /// The innermost open array is a row, and its items go straight into the Matrix or FacetArray on top.
    bool rowOpen_ = false;
    std::size_t rowBegin_ = 0;
};

#endif
