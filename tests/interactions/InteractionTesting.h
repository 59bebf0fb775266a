#ifndef QRX_TESTS_INTERACTIONS_INTERACTIONTESTING_H
#define QRX_TESTS_INTERACTIONS_INTERACTIONTESTING_H

#include "interactions/oif_InteractionBuilder.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactControls.h"
#include "support/DeckTest.h"

/// The members "steps" of a model: an initial step, and these behind it, each its class without "kprC_" and
/// "Step"; their names are Step-1, Step-2, ...
inline std::string StepsOf(const std::vector<std::string>& procedures) {
    std::string steps = R"("steps": [{"name": "Initial", "class": "kprC_InitialStep"})";
    int number = 0;
    for (const std::string& procedure : procedures) {
        steps += R"(, {"name": "Step-)" + std::to_string(++number) + R"(", "class": "kprC_)" + procedure +
                 R"(Step"})";
    }
    return steps + "]";
}

inline std::string StaticSteps(std::size_t count) {
    return StepsOf(std::vector<std::string>(count, "Static"));
}

/// A model with an instance I that has the surfaces MASTER and SLAVE, the node set NODES and the element set
/// ALL, and with further members.
class InteractionModel {
public:
    explicit InteractionModel(const std::string& members) {
        mdf_Report report;
        odb_ = mdf_ReadModelText(R"({"format": "qrx-model/1", "models": {"Default Model": {
            "parts": {"P": {"mesh": {
                "nodes": {"labels": [1, 2, 3, 4, 5, 6, 7, 8], "coordinates": [[0, 0, 0], [1, 0, 0], [1, 1, 0],
                    [0, 1, 0], [0, 0, 1], [1, 0, 1], [1, 1, 1], [0, 1, 1]]},
                "elements": [{"type": "C3D8", "labels": [1], "connectivity": [[1, 2, 3, 4, 5, 6, 7, 8]]}],
                "sets": [{"name": "MASTER", "kind": "surface", "facets": [[1, "S1"]]},
                         {"name": "SLAVE", "kind": "surface", "facets": [[1, "S2"]]},
                         {"name": "NODES", "kind": "node", "labels": [1]},
                         {"name": "ALL", "kind": "element", "labels": [1]}]}}},
            "assembly": {"instances": {"I": {"part": "P"}}}, )" +
                                     members + "}}}",
                                 "test", report);
        for (const fnd_Finding& finding : report.findings) {
            EXPECT_FALSE(finding.IsError()) << finding.place << ": " << finding.Text();
        }
        if (odb_ == nullptr) throw std::logic_error("the model can't be read");
    }

    odiK_Model& Model() { return *odb_->FindModel(odb_Odb::DefaultModelName()); }
    oif_ModelInfo& Info() {
        if (info_ == nullptr) {
            info_ = std::make_unique<oif_ModelInfo>(odb_->ddb().model(odb_Odb::DefaultModelName()));
        }
        return *info_;
    }
    const kinC_Interaction& Interaction(const cow_String& name = "C") {
        return Model().interactions.ConstGet(name);
    }
    template <class T>
    const T& As(const cow_String& name = "C") {
        return nex_canDynamicCastRef<T>(Interaction(name), NEX_HERE);
    }
    const kinC_InteractionProperty& Property(const cow_String& name = "P") {
        return Model().interactionProperties.ConstGet(name);
    }
    rgnC_Region Region(const cow_String& set) { return Model().FindRegion("I", set); }

    /// What the builder of interactions adds to the model, and to a step.
    std::string ModelText() { return TextOf(Built().ModelDefinition()); }
    std::string StepText(const cow_String& step) {
        return TextOf(Built().StepDefinition(step, cow_String()));
    }

private:
    oif_InteractionBuilder& Built() {
        if (builder_ == nullptr) {
            builder_ = std::make_unique<oif_InteractionBuilder>(Info());
            builder_->Build();
        }
        return *builder_;
    }
    static std::string TextOf(const qkw_KeywordList& keywords) {
        std::string text;
        for (int i = 0; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
        return text;
    }

    std::shared_ptr<odb_Odb> odb_;
    std::unique_ptr<oif_ModelInfo> info_;
    std::unique_ptr<oif_InteractionBuilder> builder_;
};

/// The banner of a step.
inline const std::string kBanner = "** \n** INTERACTIONS\n** \n";

/// The members of a model with the interaction C of the class, without "kinC_".
inline std::string Interactions(const std::string& className, const std::string& members) {
    return R"("interactions": {"C": {"class": "kinC_)" + className + "\", " + members + "}}";
}

#endif
