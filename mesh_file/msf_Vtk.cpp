#include "mesh_file/msf_Readers.h"
#include "mesh_file/msf_VtkGrid.h"

#include <algorithm>

namespace {

using Type = msf_NumberArray::Type;

std::string Capitals(std::string_view word) {
    std::string capitals(word);
    std::transform(capitals.begin(), capitals.end(), capitals.begin(),
                   [](char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c; });
    return capitals;
}

/// Names have their blanks and quotes as "%20".
std::string Decoded(std::string_view name) {
    const auto digit = [](char c) {
        return c >= '0' && c <= '9'   ? c - '0'
               : c >= 'A' && c <= 'F' ? c - 'A' + 10
               : c >= 'a' && c <= 'f' ? c - 'a' + 10
                                      : -1;
    };
    std::string decoded;
    for (std::size_t i = 0; i < name.size(); ++i) {
        if (name[i] == '%' && i + 2 < name.size() && digit(name[i + 1]) >= 0 && digit(name[i + 2]) >= 0) {
            decoded += static_cast<char>(16 * digit(name[i + 1]) + digit(name[i + 2]));
            i += 2;
        } else {
            decoded += name[i];
        }
    }
    return decoded;
}

class VtkReader {
public:
    VtkReader(std::string_view bytes, const msf_Options& options, msf_Mesh& mesh)
        : at_(bytes), options_(options), builder_(mesh, options) {}

    void Read() {
        ReadHead();
        while (!at_.PeekWord().empty()) ReadSection(Capitals(at_.Word("a section")));
        if (grid_.points.type == Type::NONE || grid_.types.type == Type::NONE ||
            grid_.connectivity.type == Type::NONE) {
            at_.Fail("found no points, cells or types of cells", "POINTS, CELLS and CELL_TYPES");
        }
        msf_FillFromVtk(grid_, options_, builder_);
    }

private:
    void ReadHead() {
        at_.Line();
        at_.Line();
        const std::string form = Capitals(at_.Word("ASCII or BINARY"));
        if (form != "ASCII" && form != "BINARY")
            at_.FailAtWord("found " + msf_Shown(form), "ASCII or BINARY");
        binary_ = form == "BINARY";
        if (binary_) at_.SayOffsets();
        builder_.Mesh().format = binary_ ? "VTK legacy, binary" : "VTK legacy, ASCII";
        if (Capitals(at_.Word("DATASET")) != "DATASET") at_.FailAtWord("found another word", "DATASET");
        const std::string_view kind = at_.Word("UNSTRUCTURED_GRID");
        if (Capitals(kind) != "UNSTRUCTURED_GRID")
            at_.FailAtWord("found a dataset " + msf_Shown(kind), "UNSTRUCTURED_GRID");
    }

    void ReadSection(const std::string& word) {
        if (word == "POINTS") {
            const std::size_t count = Count("points");
            const Type type = TypeOf(at_.Word("a type of numbers"));
            ReadNumbers(grid_.points, 3 * count, type);
        } else if (word == "CELLS") {
            ReadCells();
        } else if (word == "CELL_TYPES") {
            ReadNumbers(grid_.types, Count("cells"), Type::INT32);
        } else if (word == "CELL_DATA" || word == "POINT_DATA") {
            ofCells_ = word == "CELL_DATA";
            tuples_ = Count(ofCells_ ? "cells" : "points");
        } else if (word == "METADATA") {
            // Ends with a blank line.
            at_.Line();
            while (!at_.AtEnd() && !at_.Line().empty()) continue;
        } else {
            ReadAttribute(word);
        }
    }

    /// Whether the word stands ahead; raw numbers may stand there as well, of which nothing is passed over.
    bool IsNext(std::string_view word) const {
        std::string_view rest = at_.Rest().substr(0, 64);
        while (!rest.empty() && (rest.front() == ' ' || rest.front() == '\n' || rest.front() == '\r'))
            rest.remove_prefix(1);
        return Capitals(rest.substr(0, word.size())) == word;
    }

    std::size_t Count(const char* things) { return at_.Count(things, 1); }

    void ReadCells() {
        const std::size_t cells = Count("cells");
        const std::size_t numbers = Count("numbers");
        if (!IsNext("OFFSETS")) {
            grid_.countsAhead = true;
            ReadNumbers(grid_.connectivity, numbers, Type::INT32);
            return;
        }
        grid_.offsetsBeginWithZero = true;
        at_.Word("OFFSETS");
        const Type ofOffsets = TypeOf(at_.Word("a type of numbers"));
        ReadNumbers(grid_.offsets, cells, ofOffsets);
        const std::string_view word = at_.Word("CONNECTIVITY");
        if (Capitals(word) != "CONNECTIVITY") at_.FailAtWord("found " + msf_Shown(word), "CONNECTIVITY");
        const Type ofNodes = TypeOf(at_.Word("a type of numbers"));
        ReadNumbers(grid_.connectivity, numbers, ofNodes);
    }

    void ReadAttribute(const std::string& word) {
        if (word == "FIELD") {
            at_.Word("the name of a field");
            const std::size_t arrays = Count("arrays");
            for (std::size_t i = 0; i < arrays; ++i) {
                if (IsNext("METADATA")) ReadSection(Capitals(at_.Word("METADATA")));
                const std::string name = Decoded(at_.Word("the name of an array"));
                const std::size_t components = Count("components");
                const std::size_t tuples = Count("tuples");
                ReadArray(name, at_.Word("a type of numbers"), components, tuples);
            }
            return;
        }
        const std::string name = Decoded(at_.Word("the name of an array"));
        if (word == "LOOKUP_TABLE") {
            const std::size_t colours = Count("colours");
            msf_NumberArray ignored;
            ReadNumbers(ignored, 4 * colours, binary_ ? Type::UINT8 : Type::FLOAT64);
        } else if (word == "COLOR_SCALARS") {
            const std::size_t components = Count("components");
            msf_NumberArray ignored;
            ReadNumbers(ignored, components * tuples_, binary_ ? Type::UINT8 : Type::FLOAT64);
        } else if (word == "SCALARS") {
            const std::string_view type = at_.Word("a type of numbers");
            std::size_t components = 1;
            if (const std::string_view next = at_.PeekWord();
                !next.empty() && next.front() >= '0' && next.front() <= '9')
                components = Count("components");
            if (IsNext("LOOKUP_TABLE")) {
                at_.Word("LOOKUP_TABLE");
                at_.Word("the name of a table");
            }
            ReadArray(name, type, components, tuples_);
        } else if (word == "VECTORS" || word == "NORMALS") {
            ReadArray(name, at_.Word("a type of numbers"), 3, tuples_);
        } else if (word == "TENSORS") {
            ReadArray(name, at_.Word("a type of numbers"), 9, tuples_);
        } else if (word == "GLOBAL_IDS" || word == "PEDIGREE_IDS") {
            ReadArray(name, at_.Word("a type of numbers"), 1, tuples_);
        } else if (word == "TEXTURE_COORDINATES") {
            const std::size_t components = Count("components");
            ReadArray(name, at_.Word("a type of numbers"), components, tuples_);
        } else {
            at_.FailAtWord("found " + msf_Shown(word),
                           "a section such as POINTS, CELLS, CELL_TYPES or CELL_DATA");
        }
    }

    void ReadArray(const std::string& name, std::string_view typeWord, std::size_t components,
                   std::size_t tuples) {
        msf_NumberArray array;
        array.name = name;
        array.components = static_cast<int>(components);
        const Type type = TypeOf(typeWord);
        if (components > 1000) at_.FailAtWord("found " + std::to_string(components) + " components", "a few");
        ReadNumbers(array, components * tuples, type);
        if (ofCells_) grid_.cellArrays.push_back(std::move(array));
    }

    Type TypeOf(std::string_view word) const {
        static const std::pair<const char*, Type> kTypes[] = {{"CHAR", Type::INT8},
                                                              {"UNSIGNED_CHAR", Type::UINT8},
                                                              {"SHORT", Type::INT16},
                                                              {"UNSIGNED_SHORT", Type::UINT16},
                                                              {"INT", Type::INT32},
                                                              {"UNSIGNED_INT", Type::UINT32},
                                                              {"LONG", Type::INT64},
                                                              {"UNSIGNED_LONG", Type::UINT64},
                                                              {"VTKIDTYPE", Type::INT32},
                                                              {"VTKTYPEINT64", Type::INT64},
                                                              {"VTKTYPEUINT64", Type::UINT64},
                                                              {"VTKTYPEINT32", Type::INT32},
                                                              {"VTKTYPEUINT32", Type::UINT32},
                                                              {"FLOAT", Type::FLOAT32},
                                                              {"DOUBLE", Type::FLOAT64}};
        const std::string capitals = Capitals(word);
        for (const auto& [name, type] : kTypes) {
            if (capitals == name) return type;
        }
        at_.FailAtWord("found type " + msf_Shown(word),
                       "a type of numbers such as int, long, float or double");
    }

    void ReadNumbers(msf_NumberArray& array, std::size_t count, Type type) {
        if (binary_) {
            at_.Line();
            array.type = type;
            array.count = count;
            array.bigEndian = true;
            const std::size_t size = msf_NumberArray::SizeOf(type);
            if (count > at_.Left() / size)
                at_.Fail("found the end of the file", std::to_string(count) + " numbers");
            array.data = at_.Take(count * size, "numbers");
            return;
        }
        if (count > at_.Left()) at_.Fail("found the end of the file", std::to_string(count) + " numbers");
        if (type == Type::FLOAT32 || type == Type::FLOAT64) {
            std::vector<double> numbers(count);
            for (double& number : numbers) number = at_.Real("a number");
            array.Own(numbers, Type::FLOAT64);
        } else {
            std::vector<long long> numbers(count);
            for (long long& number : numbers) number = at_.Int("a whole number");
            array.Own(numbers, Type::INT64);
        }
    }

    msf_Cursor at_;
    const msf_Options& options_;
    msf_Builder builder_;
    msf_VtkGrid grid_;
    bool binary_ = false;
    bool ofCells_ = false;
    std::size_t tuples_ = 0;
};

} // namespace

bool msf_IsVtk(std::string_view bytes) {
    return bytes.starts_with("# vtk DataFile");
}

void msf_ReadVtk(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh) {
    VtkReader(input.bytes, options, mesh).Read();
}
