#include "mesh_file/msf_Readers.h"
#include "mesh_file/msf_VtkGrid.h"

#include <algorithm>
#ifdef QRX_HAS_PUGIXML
#include <pugixml.hpp>
#include <zlib.h>

namespace {

using Type = msf_NumberArray::Type;

constexpr std::string_view kAppended = "<AppendedData";

/// Base64, whose pieces may each end with their own padding.
class Base64 {
public:
    /// Appends up to `most` bytes; false at a character that is none of the code's.
    static bool Decode(std::string_view text, std::size_t most, std::vector<char>& bytes) {
        unsigned bits = 0;
        int digits = 0;
        int padding = 0;
        for (const char c : text) {
            if (bytes.size() >= most) return true;
            if (c == ' ' || c == '\n' || c == '\r' || c == '\t') continue;
            const int value = c == '=' ? 0 : ValueOf(c);
            if (value < 0) return false;
            padding += c == '=' ? 1 : 0;
            bits = bits << 6 | static_cast<unsigned>(value);
            if (++digits < 4) continue;
            for (int i = 0; i < 3 - padding; ++i)
                bytes.push_back(static_cast<char>(bits >> (16 - 8 * i) & 0xFF));
            bits = 0;
            digits = padding = 0;
        }
        return digits == 0;
    }

private:
    static int ValueOf(char c) {
        if (c >= 'A' && c <= 'Z') return c - 'A';
        if (c >= 'a' && c <= 'z') return c - 'a' + 26;
        if (c >= '0' && c <= '9') return c - '0' + 52;
        return c == '+' ? 62 : c == '/' ? 63 : -1;
    }
};

class VtuReader {
public:
    VtuReader(std::string_view bytes, const msf_Options& options, msf_Mesh& mesh)
        : bytes_(bytes), at_(bytes), options_(options), builder_(mesh, options) {}

    void Read();

private:
    void Parse();
    void ReadHead(const pugi::xml_node& root);
    pugi::xml_node Piece(const pugi::xml_node& root);
    pugi::xml_node ArrayIn(const pugi::xml_node& piece, const char* part, const char* name);
    msf_NumberArray ReadArray(const pugi::xml_node& node);
    void ReadText(msf_NumberArray& array, const pugi::xml_node& node);
    /// The bytes that an array stands for, from where they begin, as they are stored.
    void Decode(msf_NumberArray& array, std::string_view stored, bool inBase64, const pugi::xml_node& node);
    void Decompress(msf_NumberArray& array, std::string_view stored, const pugi::xml_node& node);
    std::uint64_t Size(const char* at) const;
    std::size_t Number(const pugi::xml_node& node, const char* name);
    Type TypeOf(const pugi::xml_node& node) const;
    [[noreturn]] void FailAt(const pugi::xml_node& node, std::string found, std::string expected) const;

    std::string_view bytes_;
    msf_Cursor at_;
    const msf_Options& options_;
    msf_Builder builder_;
    pugi::xml_document document_;
    msf_VtkGrid grid_;
    std::size_t headerSize_ = 4;
    bool compressed_ = false;
    std::string_view appended_;
    bool hasAppended_ = false;
    bool appendedInBase64_ = false;
    const char* form_ = "ASCII";
};

void VtuReader::Read() {
    Parse();
    const pugi::xml_node root = document_.child("VTKFile");
    ReadHead(root);
    const pugi::xml_node piece = Piece(root);
    const std::size_t points = Number(piece, "NumberOfPoints");
    const std::size_t cells = Number(piece, "NumberOfCells");
    grid_.points = ReadArray(ArrayIn(piece, "Points", nullptr));
    const pugi::xml_node types = ArrayIn(piece, "Cells", "types");
    grid_.connectivity = ReadArray(ArrayIn(piece, "Cells", "connectivity"));
    grid_.offsets = ReadArray(ArrayIn(piece, "Cells", "offsets"));
    grid_.types = ReadArray(types);
    if (grid_.points.count != 3 * points)
        FailAt(piece,
               "found " + std::to_string(grid_.points.count) + " coordinates for " + std::to_string(points) +
                   " points",
               "three for each");
    if (grid_.types.count != cells)
        FailAt(types, "found the types of " + std::to_string(grid_.types.count) + " cells",
               std::to_string(cells));
    for (const pugi::xml_node& node : piece.child("CellData").children("DataArray")) {
        const std::string name = node.attribute("Name").value();
        const bool named = std::find(options_.groupArrays.begin(), options_.groupArrays.end(), name) !=
                           options_.groupArrays.end();
        const bool ghosts = name.starts_with("vtkGhost");
        if (named || ghosts) {
            grid_.cellArrays.push_back(ReadArray(node));
        } else {
            grid_.cellArrays.emplace_back();
            grid_.cellArrays.back().type = TypeOf(node);
        }
        grid_.cellArrays.back().name = name;
        grid_.cellArrays.back().components = std::max(1, node.attribute("NumberOfComponents").as_int(1));
    }
    builder_.Mesh().format = std::string("VTU, ") + form_ +
                             (compressed_ && std::string_view(form_) != "ASCII" ? ", compressed" : "");
    msf_FillFromVtk(grid_, options_, builder_);
}

/// The appended data is no XML: the document ends where it begins.
void VtuReader::Parse() {
    std::string_view text = bytes_;
    std::string head;
    const std::size_t appended = bytes_.find(kAppended);
    if (appended != std::string_view::npos) {
        const std::size_t close = bytes_.find('>', appended);
        const std::size_t mark = close == std::string_view::npos ? close : bytes_.find('_', close);
        if (mark == std::string_view::npos)
            msf_Fail(at_.PlaceAt(appended), "found no beginning of the appended data", "'_' behind it");
        hasAppended_ = true;
        appended_ = bytes_.substr(mark + 1);
        head.assign(bytes_.substr(0, close + 1)).append("</AppendedData></VTKFile>");
        text = head;
    }
    const pugi::xml_parse_result result =
        document_.load_buffer(text.data(), text.size(), pugi::parse_default, pugi::encoding_utf8);
    if (!result)
        msf_Fail(at_.PlaceAt(static_cast<std::size_t>(result.offset)),
                 std::string("found XML that can't be read: ") + result.description(), "");
}

void VtuReader::FailAt(const pugi::xml_node& node, std::string found, std::string expected) const {
    std::string place = std::string("element ") + node.name();
    if (const pugi::xml_attribute name = node.attribute("Name")) place += " " + msf_Shown(name.value());
    const std::ptrdiff_t offset = node.offset_debug();
    msf_Fail((offset < 0 ? std::string() : at_.PlaceAt(static_cast<std::size_t>(offset)) + ": ") + place,
             std::move(found), std::move(expected));
}

void VtuReader::ReadHead(const pugi::xml_node& root) {
    if (!root) msf_Fail("", "found no element VTKFile", "one");
    const std::string type = root.attribute("type").value();
    if (type != "UnstructuredGrid")
        FailAt(root, "found a file of type " + msf_Shown(type), "'UnstructuredGrid'");
    const std::string order = root.attribute("byte_order").value();
    if (!order.empty() && order != "LittleEndian")
        FailAt(root, "found numbers in byte order " + msf_Shown(order), "'LittleEndian'");
    const std::string header = root.attribute("header_type").value();
    if (!header.empty() && header != "UInt32" && header != "UInt64")
        FailAt(root, "found headers of type " + msf_Shown(header), "'UInt32' or 'UInt64'");
    headerSize_ = header == "UInt64" ? 8 : 4;
    const std::string compressor = root.attribute("compressor").value();
    if (!compressor.empty() && compressor != "vtkZLibDataCompressor")
        FailAt(root, "found data compressed by " + msf_Shown(compressor), "'vtkZLibDataCompressor' or none");
    compressed_ = !compressor.empty();
    const std::string encoding = root.child("AppendedData").attribute("encoding").value();
    if (hasAppended_ && encoding != "raw" && encoding != "base64")
        FailAt(root.child("AppendedData"), "found data encoded as " + msf_Shown(encoding),
               "'raw' or 'base64'");
    appendedInBase64_ = encoding == "base64";
    if (appendedInBase64_) appended_ = appended_.substr(0, appended_.find('<'));
}

pugi::xml_node VtuReader::Piece(const pugi::xml_node& root) {
    const pugi::xml_node grid = root.child("UnstructuredGrid");
    if (!grid) FailAt(root, "found no element UnstructuredGrid", "one");
    pugi::xml_node found;
    for (const pugi::xml_node& piece : grid.children("Piece")) {
        if (found && Number(piece, "NumberOfCells") > 0)
            FailAt(piece, "found a second piece", "a mesh in one piece, without partitions and ghost cells");
        if (!found) found = piece;
    }
    if (!found) FailAt(grid, "found no element Piece", "one");
    return found;
}

std::size_t VtuReader::Number(const pugi::xml_node& node, const char* name) {
    const std::string text = node.attribute(name).value();
    const bool digits =
        !text.empty() && text.size() < 11 && text.find_first_not_of("0123456789") == std::string::npos;
    if (!digits || std::stoull(text) > 0x7FFFFFFF)
        FailAt(node, "found " + msf_Shown(text) + " as " + name, "a number below 2147483648");
    return static_cast<std::size_t>(std::stoull(text));
}

pugi::xml_node VtuReader::ArrayIn(const pugi::xml_node& piece, const char* part, const char* name) {
    const pugi::xml_node parent = piece.child(part);
    const pugi::xml_node node = name == nullptr ? parent.child("DataArray")
                                                : parent.find_child_by_attribute("DataArray", "Name", name);
    if (!node)
        FailAt(parent ? parent : piece,
               std::string("found no array ") + (name == nullptr ? "of points" : name), "one");
    return node;
}

Type VtuReader::TypeOf(const pugi::xml_node& node) const {
    static const std::pair<const char*, Type> kTypes[] = {
        {"Int8", Type::INT8},      {"UInt8", Type::UINT8},   {"Int16", Type::INT16},
        {"UInt16", Type::UINT16},  {"Int32", Type::INT32},   {"UInt32", Type::UINT32},
        {"Int64", Type::INT64},    {"UInt64", Type::UINT64}, {"Float32", Type::FLOAT32},
        {"Float64", Type::FLOAT64}};
    const std::string_view word = node.attribute("type").value();
    for (const auto& [name, type] : kTypes) {
        if (word == name) return type;
    }
    FailAt(node, "found numbers of type " + msf_Shown(word), "Int8 to UInt64, Float32 or Float64");
}

msf_NumberArray VtuReader::ReadArray(const pugi::xml_node& node) {
    msf_NumberArray array;
    array.type = TypeOf(node);
    const std::string format = node.attribute("format").value();
    if (format == "ascii" || format.empty()) {
        ReadText(array, node);
    } else if (format == "binary") {
        form_ = "base64";
        Decode(array, node.child_value(), true, node);
    } else if (format == "appended") {
        form_ = appendedInBase64_ ? "appended base64" : "appended raw";
        if (!hasAppended_) FailAt(node, "found appended data named", "an element AppendedData");
        const std::string offset = node.attribute("offset").value();
        const bool digits = !offset.empty() && offset.size() < 19 &&
                            offset.find_first_not_of("0123456789") == std::string::npos;
        if (!digits || std::stoull(offset) > appended_.size())
            FailAt(node, "found offset " + msf_Shown(offset), "one within the appended data");
        Decode(array, appended_.substr(std::stoull(offset)), appendedInBase64_, node);
    } else {
        FailAt(node, "found format " + msf_Shown(format), "'ascii', 'binary' or 'appended'");
    }
    return array;
}

void VtuReader::ReadText(msf_NumberArray& array, const pugi::xml_node& node) {
    msf_Cursor text(node.child_value());
    text.SayPlace(at_.PlaceAt(static_cast<std::size_t>(std::max<std::ptrdiff_t>(node.offset_debug(), 0))) +
                  ": array " + msf_Shown(node.attribute("Name").value()));
    if (array.IsReal()) {
        std::vector<double> numbers;
        while (!text.PeekWord().empty()) numbers.push_back(text.Real("a number"));
        array.Own(numbers, Type::FLOAT64);
    } else {
        std::vector<long long> numbers;
        while (!text.PeekWord().empty()) numbers.push_back(text.Int("a whole number"));
        array.Own(numbers, Type::INT64);
    }
}

std::uint64_t VtuReader::Size(const char* at) const {
    if (headerSize_ == 8) {
        std::uint64_t size = 0;
        std::memcpy(&size, at, sizeof size);
        return size;
    }
    std::uint32_t size = 0;
    std::memcpy(&size, at, sizeof size);
    return size;
}

void VtuReader::Decode(msf_NumberArray& array, std::string_view stored, bool inBase64,
                       const pugi::xml_node& node) {
    std::vector<char> plain;
    const auto decode = [&](std::size_t most) {
        plain.clear();
        plain.reserve(std::min(most, stored.size() / 4 * 3 + 3) + 3);
        if (!Base64::Decode(stored, most, plain)) FailAt(node, "found text that is no base64", "it");
    };
    if (inBase64) {
        // The first number tells how much of the rest belongs to the array.
        decode(3 * headerSize_);
        if (!compressed_ && plain.size() >= headerSize_) {
            const std::uint64_t size = Size(plain.data());
            decode(size > stored.size() ? stored.size() : static_cast<std::size_t>(size) + headerSize_);
        } else {
            decode(stored.size());
        }
        stored = {plain.data(), plain.size()};
    }
    if (stored.size() < headerSize_) FailAt(node, "found the end of the data", "the size of an array");
    if (compressed_) {
        Decompress(array, stored, node);
    } else {
        const std::uint64_t size = Size(stored.data());
        if (size > stored.size() - headerSize_)
            FailAt(node, "found " + std::to_string(stored.size() - headerSize_) + " bytes",
                   std::to_string(size));
        array.count = static_cast<std::size_t>(size) / msf_NumberArray::SizeOf(array.type);
        array.data = stored.data() + headerSize_;
        if (inBase64) {
            plain.erase(plain.begin(), plain.begin() + static_cast<std::ptrdiff_t>(headerSize_));
            array.own = std::move(plain);
            array.data = array.own.data();
        }
    }
}

/// Number of blocks, size of a block, size of the last one if it is shorter, the compressed sizes, the
/// blocks.
void VtuReader::Decompress(msf_NumberArray& array, std::string_view stored, const pugi::xml_node& node) {
    const auto number = [&](std::size_t i) -> std::uint64_t {
        if ((i + 1) * headerSize_ > stored.size())
            FailAt(node, "found the end of the data", "the sizes of its blocks");
        return Size(stored.data() + i * headerSize_);
    };
    const std::uint64_t blocks = number(0);
    if (blocks > stored.size())
        FailAt(node, "found " + std::to_string(blocks) + " blocks", "no more than there is room for");
    const std::uint64_t each = blocks == 0 ? 0 : number(1);
    const std::uint64_t last = blocks == 0 || number(2) == 0 ? each : number(2);
    std::size_t at = (3 + static_cast<std::size_t>(blocks)) * headerSize_;
    for (std::uint64_t block = 0; block < blocks; ++block) {
        const std::uint64_t packed = number(3 + static_cast<std::size_t>(block));
        const std::uint64_t size = block + 1 == blocks ? last : each;
        if (at > stored.size() || packed > stored.size() - at)
            FailAt(node, "found the end of the data", "a block of " + std::to_string(packed) + " bytes");
        // Nothing is packed to less than a thousandth.
        if (size > 1100 * packed + 64)
            FailAt(node,
                   "found a block of " + std::to_string(packed) + " bytes that is to give " +
                       std::to_string(size),
                   "a size that can be");
        const std::size_t begin = array.own.size();
        array.own.resize(begin + static_cast<std::size_t>(size));
        uLongf got = static_cast<uLongf>(size);
        const int result =
            uncompress(reinterpret_cast<Bytef*>(array.own.data() + begin), &got,
                       reinterpret_cast<const Bytef*>(stored.data() + at), static_cast<uLong>(packed));
        if (result != Z_OK || got != size)
            FailAt(node, "found a compressed block that can't be unpacked to its size",
                   std::to_string(size) + " bytes");
        at += static_cast<std::size_t>(packed);
    }
    array.data = array.own.data();
    array.count = array.own.size() / msf_NumberArray::SizeOf(array.type);
}

} // namespace

void msf_ReadVtu(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh) {
    VtuReader(input.bytes, options, mesh).Read();
}

#else

void msf_ReadVtu(const msf_Input&, const msf_Options&, msf_Mesh&) {
    msf_Fail("", "found a VTU file, and this program was built without pugixml and zlib",
             "a program built where both are installed, or the mesh as MSH, VTK or UNV");
}

#endif

bool msf_IsVtu(std::string_view bytes) {
    return bytes.substr(0, 1024).find("<VTKFile") != std::string_view::npos;
}
