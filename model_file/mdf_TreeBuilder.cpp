#include "model_file/mdf_TreeBuilder.h"

#include "store_interface/findings/fnd_Finding.h"

#include <utility>

mdf_Numbers* mdf_Builder::OpenNumbers() {
    if (frames_.empty()) return nullptr;
    mdf_Value& top = Top();
    if (!rowOpen_) return top.As<mdf_Numbers>();
    mdf_Rows* rows = top.As<mdf_Rows>();
    return rows == nullptr ? nullptr : &rows->numbers;
}

mdf_Rows* mdf_Builder::OpenRows() {
    return frames_.empty() || rowOpen_ ? nullptr : Top().As<mdf_Rows>();
}

void mdf_Builder::Number(const mdf_Number& number) {
    if (number.kind == mdf_Number::Kind::INT)
        Int(number.whole);
    else
        Real(number.value, number.kind == mdf_Number::Kind::LARGE);
}

void mdf_Builder::Int(int value) {
    mdf_Facets* facets = rowOpen_ ? Top().As<mdf_Facets>() : nullptr;
    if (facets != nullptr) {
        std::vector<int>& pairs = facets->pairs;
        if (pairs.size() - rowBegin_ < 2) {
            pairs.push_back(value);
            return;
        }
        DemoteRow();
    }
    if (mdf_Numbers* numbers = OpenNumbers())
        numbers->AddInt(value);
    else
        Place(mdf_Value(value));
}

void mdf_Builder::Real(double value, bool isLarge) {
    if (rowOpen_ && Top().As<mdf_Facets>() != nullptr) DemoteRow();
    if (mdf_Numbers* numbers = OpenNumbers()) {
        numbers->AddReal(value, isLarge);
    } else {
        Place(isLarge ? mdf_Value(mdf_Value::Data(mdf_Value::Large{value})) : mdf_Value(value));
    }
}

void mdf_Builder::String(std::string_view text) {
    if (!rowOpen_ || !AddFacetName(text)) Other(mdf_Value(text));
}

bool mdf_Builder::AddFacetName(std::string_view text) {
    mdf_Value& top = Top();
    if (mdf_Rows* rows = top.As<mdf_Rows>()) {
        const bool pairsSoFar =
            rows->numbers.allInts && rows->ends.empty() && (rows->count == 0 || rows->length == 2);
        if (!pairsSoFar || rows->numbers.Size() - rowBegin_ != 1) return false;
        mdf_Facets facets;
        facets.pairs = std::move(rows->numbers.ints);
        top = mdf_Value::Of(std::move(facets));
    } else if (top.As<mdf_Facets>()->pairs.size() - rowBegin_ != 1) {
        return false;
    }
    top.As<mdf_Facets>()->AddName(text);
    return true;
}

/// Makes the array on top general, and the row that is open an array of its own on top of it.
void mdf_Builder::DemoteRow() {
    mdf_Value& top = Top();
    mdf_Value row;
    if (mdf_Rows* rows = top.As<mdf_Rows>()) {
        mdf_Numbers& numbers = rows->numbers;
        row = numbers.Slice(rowBegin_, numbers.Size());
        numbers.Truncate(rowBegin_);
    } else {
        mdf_Facets& facets = *top.As<mdf_Facets>();
        const std::size_t filled = facets.pairs.size() - rowBegin_;
        if (filled == 2) {
            row = top.Item(facets.Count() - 1);
        } else {
            mdf_Numbers label;
            if (filled == 1) label.AddInt(facets.pairs.back());
            row = label.Slice(0, filled);
        }
        facets.pairs.resize(rowBegin_);
    }
    top.Generalise();
    frames_.push_back(std::move(row));
    rowOpen_ = false;
}

void mdf_Builder::Other(mdf_Value value) {
    if (rowOpen_) DemoteRow();
    Place(std::move(value));
}

void mdf_Builder::Place(mdf_Value value) {
    if (frames_.empty()) {
        root_ = std::move(value);
        return;
    }
    mdf_Value& top = Top();
    if (mdf_ObjectData* object = top.As<mdf_ObjectData>()) {
        object->members.back().value = std::move(value);
        return;
    }
    top.Generalise();
    top.Items().push_back(std::move(value));
}

void mdf_Builder::BeginObject() {
    if (rowOpen_) DemoteRow();
    frames_.push_back(mdf_Value::Of(mdf_ObjectData()));
}

void mdf_Builder::Key(std::string_view name) {
    Top().As<mdf_ObjectData>()->members.push_back({std::string(name), mdf_Value()});
}

std::vector<std::string> mdf_Builder::EndObject(std::string& pointer) {
    std::vector<std::string> repeated = Top().As<mdf_ObjectData>()->Index();
    mdf_Value object = std::move(Top());
    frames_.pop_back();
    if (!repeated.empty()) pointer = PointerOfNext();
    Other(std::move(object));
    return repeated;
}

/// Of the value that is placed next.
std::string mdf_Builder::PointerOfNext() const {
    std::string pointer;
    for (const mdf_Value& frame : frames_) {
        if (frame.IsObject())
            fnd_AppendPointer(pointer, frame.Members().back().name);
        else
            fnd_AppendPointer(pointer, std::to_string(frame.Size()));
    }
    return pointer;
}

void mdf_Builder::BeginArray() {
    if (rowOpen_) DemoteRow();
    if (!frames_.empty()) {
        mdf_Value& top = Top();
        const mdf_Numbers* numbers = top.As<mdf_Numbers>();
        if (numbers != nullptr && numbers->Size() == 0) top = mdf_Value::Of(mdf_Rows());
        const mdf_Rows* rows = top.As<mdf_Rows>();
        const mdf_Facets* facets = top.As<mdf_Facets>();
        rowOpen_ = rows != nullptr || facets != nullptr;
        if (rowOpen_) {
            rowBegin_ = rows != nullptr ? rows->numbers.Size() : facets->pairs.size();
            return;
        }
    }
    frames_.push_back(mdf_Value::Of(mdf_Numbers()));
}

void mdf_Builder::EndArray() {
    mdf_Rows* rows = rowOpen_ ? Top().As<mdf_Rows>() : nullptr;
    if (rows != nullptr) {
        rows->CloseRow();
        rowOpen_ = false;
        return;
    }
    if (rowOpen_ && Top().As<mdf_Facets>()->pairs.size() - rowBegin_ == 2) {
        rowOpen_ = false;
        return;
    }
    if (rowOpen_) DemoteRow();
    mdf_Value array = std::move(Top());
    frames_.pop_back();
    Other(std::move(array));
}
