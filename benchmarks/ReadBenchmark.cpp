// Reading a model file of a million nodes and hexahedra: the document, and the store that it fills, beside
// other readers of JSON that put the same numbers into the same arrays.
//     bench_read [ROUNDS]
// The best of the rounds counts, in which all take turns. The exit code is 1 when a bound is missed.
#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Parser.h"

#include <nlohmann/json.hpp>
#include <simdjson.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <numeric>
#include <random>
#include <sstream>

namespace {

std::string ModelText(int count) {
    odb_Odb odb;
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    odiK_Part& part = model.AddPart("P");
    part.mesh.Reset(new odiK_Mesh());
    std::vector<int> labels(static_cast<std::size_t>(count));
    std::iota(labels.begin(), labels.end(), 1);
    // Every fourth label is left out, so that the labels stand in the file and are no range.
    for (int& label : labels) label += label / 3;
    std::mt19937 random(1);
    std::uniform_real_distribution<float> side(-500.0F, 500.0F);
    std::vector<float> xyz(3 * labels.size());
    for (std::size_t i = 0; i < xyz.size(); ++i) xyz[i] = i % 30 == 29 ? 0.0F : side(random);
    part.mesh->SetNodes(labels, xyz);
    std::vector<int> corners;
    corners.reserve(8 * labels.size());
    for (int e = 0; e < count; ++e) {
        for (int k = 0; k < 8; ++k)
            corners.push_back(labels[static_cast<std::size_t>((e * 7 + k * 13) % count)]);
    }
    part.mesh->AddElements("C3D8", labels, 8, std::move(corners));
    model.AddInstance("I", "P");
    model.Complete();
    std::ostringstream out;
    mdf_WriteModelFile(odb, out);
    return out.str();
}

struct Arrays {
    std::vector<int> ints;
    std::vector<double> reals;
};

/// Numbers as they come, of all arrays in one.
struct SaxArrays : nlohmann::json_sax<nlohmann::json> {
    Arrays arrays;
    bool null() override { return true; }
    bool boolean(bool) override { return true; }
    bool number_integer(number_integer_t value) override {
        arrays.ints.push_back(static_cast<int>(value));
        return true;
    }
    bool number_unsigned(number_unsigned_t value) override {
        arrays.ints.push_back(static_cast<int>(value));
        return true;
    }
    bool number_float(number_float_t value, const string_t&) override {
        arrays.reals.push_back(value);
        return true;
    }
    bool string(string_t&) override { return true; }
    bool binary(binary_t&) override { return true; }
    bool start_object(std::size_t) override { return true; }
    bool key(string_t&) override { return true; }
    bool end_object() override { return true; }
    bool start_array(std::size_t) override { return true; }
    bool end_array() override { return true; }
    bool parse_error(std::size_t, const std::string&, const nlohmann::detail::exception&) override {
        return false;
    }
};

void Append(std::vector<int>& to, simdjson::ondemand::array labels) {
    for (auto label : labels) to.push_back(static_cast<int>(std::int64_t(label)));
}

Arrays OnDemand(const simdjson::padded_string& text) {
    Arrays arrays;
    simdjson::ondemand::parser parser;
    auto document = parser.iterate(text);
    simdjson::ondemand::object mesh = document["models"]["Default Model"]["parts"]["P"]["mesh"].get_object();
    simdjson::ondemand::object nodes = mesh["nodes"].get_object();
    Append(arrays.ints, nodes["labels"].get_array());
    for (auto row : nodes["coordinates"].get_array()) {
        for (auto value : row.get_array()) arrays.reals.push_back(double(value));
    }
    for (auto elements : mesh["elements"].get_array()) {
        Append(arrays.ints, elements["labels"].get_array());
        for (auto row : elements["connectivity"].get_array()) Append(arrays.ints, row.get_array());
    }
    return arrays;
}

double SecondsOf(const std::function<void()>& task) {
    const auto start = std::chrono::steady_clock::now();
    task();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

void Require(bool good) {
    if (!good) std::exit(2);
}

} // namespace

int main(int argc, char** argv) {
    const int rounds = argc > 1 ? std::atoi(argv[1]) : 7;
    const std::string text = ModelText(1000000);
    const simdjson::padded_string padded(text);
    struct Reader {
        const char* name;
        std::function<void()> read;
        double best = 1e9;
    } readers[] = {{"our document",
                    [&] {
                        mdf_Value root;
                        std::vector<fnd_Finding> errors;
                        Require(mdf_Parse(text, root, errors));
                    }},
                   {"our document and store",
                    [&] {
                        mdf_Report report;
                        Require(mdf_ReadModelText(text, "m.json", report) != nullptr);
                    }},
                   {"nlohmann-json, SAX",
                    [&] {
                        SaxArrays sax;
                        Require(nlohmann::json::sax_parse(text, &sax));
                    }},
                   {"simdjson, on demand", [&] { Require(OnDemand(padded).ints.size() == 10000000); }}};
    for (int i = 0; i < rounds; ++i) {
        for (Reader& reader : readers) reader.best = std::min(reader.best, SecondsOf(reader.read));
    }
    const double megabytes = static_cast<double>(text.size()) / 1e6;
    for (const Reader& reader : readers)
        std::printf("%-24s %6.0f ms  %5.0f MB/s\n", reader.name, reader.best * 1e3, megabytes / reader.best);
    const double overSax = readers[2].best / readers[0].best;
    const double overOnDemand = readers[0].best / readers[3].best;
    std::printf(
        "%.0f MB: %.1f times as fast as nlohmann-json (at least 5); %.2f times the time of simdjson (at "
        "most 1.5)\n",
        megabytes, overSax, overOnDemand);
    return overSax < 5 || overOnDemand > 1.5 ? 1 : 0;
}
