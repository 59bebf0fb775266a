#include "DeckTesting.h"
#include "deck/oif_Writer.h"
#include "store_interface/model/odb_Odb.h"
#include "support/TestFolder.h"
#include "tools/DeckCommands.h"
#include "tools/DeckProof.h"

#include <rapidcheck/gtest.h>

namespace {

int Upto(int most) {
    return *rc::gen::inRange(0, most + 1);
}

float AnyCoordinate() {
    return *rc::gen::element(0.0F, -0.0F, 1.0F, 0.1F, -2.5F, 1e-30F, 3.0e38F, 12345.678F, 1.0F / 3.0F);
}

/// A new name; names that fold to one another would be one name of the deck.
cow_String AnyName(const char* what, int number) {
    const std::string stem =
        *rc::gen::element<std::string>("N", "n-", "a.b", "x, y ", " lead", "\xC3\xA9", "*star", "_", "1st");
    return cow_String(std::string_view(stem + what + std::to_string(number)));
}

std::vector<int> NewLabels(int count) {
    std::vector<int> labels;
    int last = 0;
    for (int i = 0; i < count; ++i) labels.push_back(last += 1 + Upto(3) * Upto(20));
    if (count > 1 && Upto(2) == 0) std::swap(labels.front(), labels.back());
    return labels;
}

std::vector<int> Some(const std::vector<int>& labels, int most) {
    std::vector<int> some;
    const int count = labels.empty() ? 0 : Upto(most);
    for (int i = 0; i < count; ++i) some.push_back(*rc::gen::elementOf(labels));
    return some;
}

struct Labels {
    std::vector<int> nodes;
    std::vector<int> elements;
};

Labels FillMesh(odiK_Mesh& mesh) {
    Labels labels;
    labels.nodes = NewLabels(Upto(40));
    std::vector<float> coordinates;
    for (std::size_t i = 0; i < 3 * labels.nodes.size(); ++i) coordinates.push_back(AnyCoordinate());
    mesh.SetNodes(labels.nodes, coordinates);
    if (labels.nodes.empty()) return labels;
    struct Type {
        const char* label;
        int nodes;
    };
    constexpr Type kTypes[] = {{"C3D8", 8}, {"C3D20", 20}, {"S4", 4}, {"T3D2", 2}, {"MASS", 1}, {"U16", 16}};
    int last = 0;
    const int classes = Upto(4);
    for (int c = 0; c < classes; ++c) {
        const Type type = kTypes[static_cast<std::size_t>(Upto(5))];
        std::vector<int> own;
        for (int i = Upto(6); i > 0; --i) own.push_back(last += 1 + Upto(9));
        std::vector<int> nodes;
        for (std::size_t i = 0; i < own.size() * static_cast<std::size_t>(type.nodes); ++i) {
            nodes.push_back(*rc::gen::elementOf(labels.nodes));
        }
        mesh.AddElements(type.label, own, type.nodes, nodes);
        labels.elements.insert(labels.elements.end(), own.begin(), own.end());
    }
    for (int s = Upto(3); s > 0; --s) mesh.AddNodeSet(AnyName("n", s), Some(labels.nodes, 40));
    for (int s = Upto(3); s > 0; --s)
        mesh.AddElementSet(AnyName("e", s), Some(labels.elements, 30), Upto(1) == 1);
    for (int s = Upto(2); s > 0; --s) {
        std::vector<odiK_FacetInput> facets;
        // 0 and 1 are faces of elements of every shape.
        for (const int label : Some(labels.elements, 8)) facets.push_back({label, Upto(1), {}});
        mesh.AddSurface(AnyName("s", s), facets);
    }
    return labels;
}

void FillModel(odiK_Model& model) {
    std::vector<Labels> labels;
    std::vector<cow_String> parts;
    for (int p = 1 + Upto(1); p > 0; --p) {
        parts.push_back(AnyName("p", p));
        odiK_Part& part = model.AddPart(parts.back());
        part.mesh = cow_CountedHld<odiK_Mesh>(new odiK_Mesh());
        labels.push_back(FillMesh(*part.mesh));
    }
    std::vector<cow_String> instances;
    std::vector<std::size_t> partOf;
    for (int i = Upto(3); i > 0; --i) {
        partOf.push_back(static_cast<std::size_t>(Upto(static_cast<int>(parts.size()) - 1)));
        instances.push_back(AnyName("i", i));
        odiK_Instance& instance = model.AddInstance(instances.back(), parts[partOf.back()]);
        for (float& value : instance.translation) value = *rc::gen::element(0.0F, 0.0F, 1.5F, -20.0F);
        for (float& value : instance.rotation) value = *rc::gen::element(0.0F, 0.0F, 0.5F, -1.0F);
    }
    for (int s = instances.empty() ? 0 : Upto(3); s > 0; --s) {
        std::vector<std::vector<int>> members;
        std::vector<odiK_MemberInput> inputs;
        const bool areNodes = Upto(1) == 0;
        for (std::size_t i = 0; i < instances.size(); ++i) {
            members.push_back(Some(areNodes ? labels[partOf[i]].nodes : labels[partOf[i]].elements, 10));
        }
        for (std::size_t i = 0; i < instances.size(); ++i) {
            if (!members[i].empty()) inputs.push_back({instances[i], members[i], {}});
        }
        if (inputs.empty()) continue;
        model.AddAssemblySet(AnyName("A", s), areNodes ? res_SetTypeEnm::NODES : res_SetTypeEnm::ELEMENTS,
                             inputs);
    }
}

} // namespace

RC_GTEST_PROP(RandomStore, ItsDeck_ReadsBackAsTheStoreIs, ()) {
    odb_Odb odb;
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    FillModel(model);
    const TestFolder folder;
    oif_Writer(odb).WriteInputFile(folder.Path("deck").c_str());
    drd_Findings findings;
    const drd_Deck deck = ReadDeck(folder.Path("deck.inp"), {}, findings);
    RC_ASSERT(!findings.HasErrors());
    const Strings problems = ProveDeck(model, deck);
    RC_ASSERT(problems == Strings());
    RC_ASSERT(drd_Diff(deck, deck, {}).IsEqual());
    drd_CheckDeck(deck, DeckOptions(), findings);
    RC_ASSERT(!findings.HasErrors());
    drd_Findings ofFlat;
    const drd_Deck flat = drd_ReadDeckText(Flattened(deck, ofFlat), "flat", DeckOptions(), ofFlat);
    drd_CheckDeck(flat, DeckOptions(), ofFlat);
    RC_ASSERT(!ofFlat.HasErrors());
}
