#include "deck/oif_Builder.h"

#include "foundation/qio_Device.h"
#include "mesh/oif_Element.h"
#include "mesh/oif_Node.h"

#include <algorithm>

oif_Builder::oif_Builder(oif_ModelInfo& modelInfo, int threads)
    : jobKeywords_(modelInfo), instance_(modelInfo), amplitude_(modelInfo), material_(modelInfo),
      transform_(modelInfo), boundaryCondition_(modelInfo), step_(modelInfo), load_(modelInfo),
      field_(modelInfo), interaction_(modelInfo), constraint_(modelInfo), outputRequest_(modelInfo),
      part_(modelInfo), partAttributes_(modelInfo), region_(modelInfo), final_(modelInfo),
      v6Format_(modelInfo.V6Format()), threads_(threads),
      model_(&modelInfo.Model()), components_{
                                      &jobKeywords_, &part_,           &instance_,          &step_,
                                      &region_,      &partAttributes_, &amplitude_,         &material_,
                                      &transform_,   &constraint_,     &boundaryCondition_, &load_,
                                      &field_,       &interaction_,    &outputRequest_,     &final_} {}

bool oif_Builder::WriteInputFile(const cow_String& fileName) {
    qio_CurrentSystem().remove(fileName.CStr());
    std::FILE* file = qio_OpenFile(fileName.CStr(), "w");
    if (file == nullptr) return false;
    qio_ios device;
    device.attach(file, true);
    WriteInput(device);
    device.close();
    return true;
}

void oif_Builder::WriteInput(qio_ostream& device) {
    // Where the long texts are kept, a large buffer is more work to make than it saves.
    constexpr std::size_t small = std::size_t{16} * 1024;
    utl_Stream stream(device, LineLimit, Precision, Precision, texts_ == nullptr ? 0 : small);
    // What another thread reads is not noted.
    stream.SetThreads(keeping_ == nullptr ? threads_ : 1);
    BuildComponents();
    WriteSlot(stream, 0, [&] { WriteInput(stream, jobKeywords_.ModelDefinition()); });
    WritePartDefinitions(stream);
    WritePartInstanceDefinitions(stream);
    WriteAssemblyDefinitions(stream);
    WriteOtherModelDefinitions(stream);
    WriteStepDefinitions(stream);
    WriteLeftSlots(stream);
    stream.Flush();
}

qkw_FilingLog oif_Builder::BuildLogged() {
    qkw_FilingLog log;
    qkw_BuilderComponent* const made[] = {&step_, &constraint_, &boundaryCondition_,
                                          &load_, &field_,      &interaction_};
    for (qkw_BuilderComponent* component : made) component->LogTo(log);
    BuildComponents();
    return log;
}

void oif_Builder::GoBy(const oif_KeptDeck& kept, const odiK_Model& model) {
    static_assert(oif_KeptDeck::kSpeakers == kComponents + 1);
    kept_ = &kept;
    isLeft_ = kept.SpeakersLike(model);
}

// Later components use what earlier ones stored in the model info: labels first, regions behind instances and
// steps, section assignment behind regions.
void oif_Builder::BuildComponents() {
    qkw_BuilderComponent* const order[kComponents] = {
        &jobKeywords_,   &part_,      &material_,   &instance_,          &step_, &region_, &partAttributes_,
        &amplitude_,     &transform_, &constraint_, &boundaryCondition_, &load_, &field_,  &interaction_,
        &outputRequest_, &final_};
    for (qkw_BuilderComponent* component : order) {
        const auto place =
            static_cast<std::size_t>(std::ranges::find(components_, component) - components_.begin());
        if (isLeft_[place]) continue;
        if (keeping_ == nullptr) {
            component->Build();
        } else {
            keeping_->Watch(place, [&] { component->Build(); });
        }
    }
}

template <class Writing>
void oif_Builder::WriteSlot(utl_Stream& stream, std::size_t speaker, const Writing& write) {
    if (keeping_ != nullptr) {
        keeping_->Watch(speaker, [&] {
            write();
            stream.Flush();
        });
        return keeping_->EndSlot();
    }
    if (kept_ == nullptr) return write();
    if (!isLeft_[speaker]) {
        WriteLeftSlots(stream);
        write();
        firstLeft_ = slot_ + 1;
    }
    ++slot_;
}

void oif_Builder::WriteLeftSlots(utl_Stream& stream) {
    if (kept_ == nullptr || firstLeft_ == slot_) return;
    stream.Flush();
    kept_->Write(firstLeft_, slot_, *texts_);
    firstLeft_ = slot_;
}

template <class KeywordsOf>
void oif_Builder::WriteSection(utl_Stream& stream, const KeywordsOf& keywordsOf) {
    // The job's own keywords stand at the head of the deck alone.
    for (std::size_t i = 1; i < kComponents; ++i)
        WriteSlot(stream, i, [&] { WriteInput(stream, keywordsOf(*components_[i])); });
}

void oif_Builder::WriteHeading(utl_Stream& stream, const cow_String& text) const {
    // The blank lines of this banner are "**", those of a comment are "** ".
    stream << "**" << endl << "** " << text << endl << "**" << endl;
}

void oif_Builder::WriteInput(utl_Stream& stream, const qkw_KeywordList& keywords) const {
    for (const qkw_KeywordHandle& keyword : keywords) keyword.ConstGet().Write(stream);
}

void oif_Builder::WriteOfInstance(utl_Stream& stream, const qkw_BuilderComponent& component,
                                  const ddb_BaseInstance& instance, const qkw_KeywordList& keywords) const {
    if (texts_ == nullptr || !instance.IsPartInstance()) return WriteInput(stream, keywords);
    const ddb_Mesh view = ddb_PartInstance(instance).mesh();
    const cow_CountedHld<odiK_Mesh>& mesh = view.Handle();
    // All that this component says of an instance are the sets of its mesh, by names and labels.
    if (dynamic_cast<const oif_RegionBuilder*>(&component) != nullptr) {
        WriteKept(stream, mesh, oif_MeshBlockEnm::SETS, [&](utl_Stream& own) { WriteInput(own, keywords); });
        return;
    }
    for (const qkw_KeywordHandle& handle : keywords) {
        const qkw_Keyword& keyword = handle.ConstGet();
        const auto write = [&keyword](utl_Stream& own) { keyword.Write(own); };
        if (dynamic_cast<const oif_Node*>(&keyword) != nullptr) {
            WriteKept(stream, mesh, oif_MeshBlockEnm::NODES, write);
        } else if (dynamic_cast<const oif_ElementFromMesh*>(&keyword) != nullptr) {
            WriteKept(stream, mesh, oif_MeshBlockEnm::ELEMENTS, write);
        } else {
            keyword.Write(stream);
        }
    }
}

template <class Writing>
void oif_Builder::WriteKept(utl_Stream& stream, const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block,
                            const Writing& write) const {
    oif_MeshTexts::Text text = texts_->Find(*mesh, block);
    if (text == nullptr) {
        qio_StringDevice device;
        utl_Stream own(device, LineLimit, Precision, Precision);
        write(own);
        own.Flush();
        std::string made = device.Text();
        // The line end goes through the stream, which then knows that a line begins.
        if (!made.empty()) made.pop_back();
        text = texts_->Keep(mesh, block, std::make_shared<const std::string>(std::move(made)));
    }
    if (text->empty()) return;
    stream.Flush();
    texts_->WriteKept(text);
    stream.LineBreak();
}

void oif_Builder::WritePartDefinitions(utl_Stream& stream) {
    if (v6Format_) WriteSlot(stream, kDriver, [&] { WriteHeading(stream, "PARTS"); });
    for (const auto& [name, part] : model_->Parts()) {
        WriteSection(stream, [&key = name](qkw_BuilderComponent& each) { return each.PartDefinition(key); });
    }
}

void oif_Builder::WritePartInstanceDefinitions(utl_Stream& stream) {
    if (v6Format_) {
        WriteSlot(stream, kDriver, [&] {
            WriteHeading(stream, "ASSEMBLY");
            // The assembly's name goes out as it stands, without quotes.
            stream << "*Assembly, name=" << model_->Model().rootAssembly().name() << endl;
        });
    }
    for (const auto& [name, instance] : model_->Instances()) {
        for (std::size_t i = 1; i < kComponents; ++i) {
            WriteSlot(stream, i, [&, &key = name, &of = instance] {
                WriteOfInstance(stream, *components_[i], of, components_[i]->InstanceDefinition(key));
            });
        }
    }
}

void oif_Builder::WriteAssemblyDefinitions(utl_Stream& stream) {
    WriteSection(stream, [](qkw_BuilderComponent& each) { return each.AssemblyDefinition(); });
}

void oif_Builder::WriteOtherModelDefinitions(utl_Stream& stream) {
    WriteSection(stream, [](qkw_BuilderComponent& each) { return each.ModelDefinition(); });
}

void oif_Builder::WriteStepDefinitions(utl_Stream& stream) {
    for (const auto& [stepName, anyStep] : model_->Steps()) {
        const nex_Context context("step", stepName);
        const auto write = [&, &step = stepName](const cow_String& secondKey) {
            WriteSection(stream,
                         [&](qkw_BuilderComponent& each) { return each.StepDefinition(step, secondKey); });
        };
        write({});
        // The initial step has no load cases.
        if (stepName == model_->InitialStepName()) continue;
        const auto& step = nex_canDynamicCastRef<kprC_AnalysisStep>(anyStep, NEX_HERE);
        for (const auto& [loadCaseName, loadCase] : step.loadCases) {
            // The list of the empty key is the body.
            if (!loadCaseName.IsEmpty()) write(loadCaseName);
        }
    }
}
