#ifndef QRX_OIF_BUILDER_H
#define QRX_OIF_BUILDER_H

#include "amplitudes/oif_AmplitudeBuilder.h"
#include "assembly/oif_InstanceBuilder.h"
#include "assembly/oif_PartBuilder.h"
#include "conditions/oif_BoundaryConditionBuilder.h"
#include "conditions/oif_FieldBuilder.h"
#include "conditions/oif_LoadBuilder.h"
#include "constraints/oif_ConstraintBuilder.h"
#include "deck/oif_FinalBuilder.h"
#include "deck/oif_JobKeywordsBuilder.h"
#include "deck/oif_KeptDeck.h"
#include "interactions/oif_InteractionBuilder.h"
#include "materials/oif_MaterialBuilder.h"
#include "mesh/oif_RegionBuilder.h"
#include "output/oif_OutputRequestBuilder.h"
#include "sections/oif_PartAttributesBuilder.h"
#include "sections/oif_TransformBuilder.h"
#include "steps/oif_StepBuilder.h"

/// The driver of one file: lets the sixteen components build, then writes their keywords, section by section
/// (parts, instances, assembly, model, steps) and within a section component by component.
class oif_Builder {
public:
    /// `threads` as for oif_Writer.
    explicit oif_Builder(oif_ModelInfo& modelInfo, int threads = 0);
    oif_Builder(const oif_Builder&) = delete;
    oif_Builder& operator=(const oif_Builder&) = delete;

    /// Deletes an old file of the name and writes the deck. False when the file can't be opened; whether all
    /// bytes arrived tells qio_LastReport().
    bool WriteInputFile(const cow_String& fileName);
    /// Writes the deck to a device.
    void WriteInput(qio_ostream& device);
    /// From now on texts of meshes come from the device that the deck is written to, where it keeps them.
    void KeepTexts(oif_MeshTexts& texts) { texts_ = &texts; }
    /// Goes by a kept deck for this model, whose deck must be written to a device that keeps texts.
    void GoBy(const oif_KeptDeck& kept, const odiK_Model& model);
    /// Keeps the deck, which must be written to a device that keeps texts.
    void KeepDeck(oif_KeptDeck& kept) { keeping_ = &kept; }
    /// Builds as for a deck, writes nothing, and gives the keywords of single objects. One of the three may
    /// be called, and once.
    qkw_FilingLog BuildLogged();

    /// The measures of a deck's stream.
    static constexpr int LineLimit = 131;
    static constexpr int Precision = 6;

private:
    void BuildComponents();
    /// Lets a component write what it says in a section, or the driver (kDriver) lines of its own; leaves it
    /// to the kept deck where that has the same.
    template <class Writing>
    void WriteSlot(utl_Stream& stream, std::size_t speaker, const Writing& write);
    /// Has each component write what `keywordsOf` gives of it.
    template <class KeywordsOf>
    void WriteSection(utl_Stream& stream, const KeywordsOf& keywordsOf);
    /// Writes the slots that were left to the kept deck.
    void WriteLeftSlots(utl_Stream& stream);
    void WriteHeading(utl_Stream& stream, const cow_String& text) const;
    void WriteInput(utl_Stream& stream, const qkw_KeywordList& keywords) const;
    void WriteOfInstance(utl_Stream& stream, const qkw_BuilderComponent& component,
                         const ddb_BaseInstance& instance, const qkw_KeywordList& keywords) const;
    /// Writes what `write` gives, which the mesh alone decides.
    template <class Writing>
    void WriteKept(utl_Stream& stream, const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block,
                   const Writing& write) const;
    void WritePartDefinitions(utl_Stream& stream);
    void WritePartInstanceDefinitions(utl_Stream& stream);
    void WriteAssemblyDefinitions(utl_Stream& stream);
    void WriteOtherModelDefinitions(utl_Stream& stream);
    void WriteStepDefinitions(utl_Stream& stream);

    static constexpr std::size_t kComponents = 16;
    static constexpr std::size_t kDriver = kComponents;

    oif_JobKeywordsBuilder jobKeywords_;
    oif_InstanceBuilder instance_;
    oif_AmplitudeBuilder amplitude_;
    oif_MaterialBuilder material_;
    oif_TransformBuilder transform_;
    oif_BoundaryConditionBuilder boundaryCondition_;
    oif_StepBuilder step_;
    oif_LoadBuilder load_;
    oif_FieldBuilder field_;
    oif_InteractionBuilder interaction_;
    oif_ConstraintBuilder constraint_;
    oif_OutputRequestBuilder outputRequest_;
    oif_PartBuilder part_;
    oif_PartAttributesBuilder partAttributes_;
    oif_RegionBuilder region_;
    oif_FinalBuilder final_;
    bool v6Format_;
    int threads_;
    const oif_Model* model_;
    oif_MeshTexts* texts_ = nullptr;

    /// In the order of their text within a section; the order of building is another.
    std::array<qkw_BuilderComponent*, kComponents> components_;
    oif_KeptDeck* keeping_ = nullptr;
    const oif_KeptDeck* kept_ = nullptr;
    std::array<bool, kComponents + 1> isLeft_{}; ///< to the kept deck
    std::size_t slot_ = 0;
    std::size_t firstLeft_ = 0;
};

#endif
