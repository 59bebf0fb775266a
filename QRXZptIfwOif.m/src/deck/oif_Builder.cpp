#include "deck/oif_Builder.h"

#include "foundation/qio_Device.h"
#include "mesh/oif_Element.h"
#include "mesh/oif_Node.h"

oif_Builder::oif_Builder(oif_ModelInfo& modelInfo, int threads)
    : jobKeywords_(modelInfo), instance_(modelInfo), amplitude_(modelInfo), material_(modelInfo),
      transform_(modelInfo), boundaryCondition_(modelInfo), step_(modelInfo), load_(modelInfo),
      field_(modelInfo), interaction_(modelInfo), constraint_(modelInfo), outputRequest_(modelInfo),
      part_(modelInfo), partAttributes_(modelInfo), region_(modelInfo), final_(modelInfo),
      v6Format_(modelInfo.V6Format()), threads_(threads), model_(&modelInfo.Model()) {}

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
    stream.SetThreads(threads_);
    BuildComponents();
    qkw_ComponentList components = WriteList();
    WriteInput(stream, jobKeywords_.ModelDefinition());
    WritePartDefinitions(stream, components);
    WritePartInstanceDefinitions(stream, components);
    WriteAssemblyDefinitions(stream, components);
    WriteOtherModelDefinitions(stream, components);
    WriteStepDefinitions(stream, components);
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

// Later components use what earlier ones stored in the model info: labels first, regions behind instances and
// steps, section assignment behind regions.
void oif_Builder::BuildComponents() {
    jobKeywords_.Build();
    part_.Build();
    material_.Build();
    instance_.Build();
    step_.Build();
    region_.Build();
    partAttributes_.Build();
    amplitude_.Build();
    transform_.Build();
    constraint_.Build();
    boundaryCondition_.Build();
    load_.Build();
    field_.Build();
    interaction_.Build();
    outputRequest_.Build();
    final_.Build();
}

// The order of the text within one section; not the order of building.
qkw_ComponentList oif_Builder::WriteList() const {
    qkw_ComponentList components;
    const qkw_BuilderComponent* const order[] = {
        &part_,      &instance_, &step_,        &region_,        &partAttributes_,
        &amplitude_, &material_, &transform_,   &constraint_,    &boundaryCondition_,
        &load_,      &field_,    &interaction_, &outputRequest_, &final_};
    for (const qkw_BuilderComponent* component : order) components.Append(*component);
    return components;
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
    const odiK_Mesh& mesh = view.mesh();
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
void oif_Builder::WriteKept(utl_Stream& stream, const odiK_Mesh& mesh, oif_MeshBlockEnm block,
                            const Writing& write) const {
    oif_MeshTexts::Text text = texts_->Find(mesh, block);
    if (text == nullptr) {
        qio_StringDevice device;
        utl_Stream own(device, LineLimit, Precision, Precision);
        write(own);
        own.Flush();
        std::string made = device.Text();
        // The line end goes through the stream, which then knows that a line begins.
        if (!made.empty()) made.pop_back();
        text = std::make_shared<const std::string>(std::move(made));
        texts_->Keep(mesh, block, text);
    }
    if (text->empty()) return;
    stream.Flush();
    texts_->WriteKept(text);
    stream.LineBreak();
}

void oif_Builder::WritePartDefinitions(utl_Stream& stream, qkw_ComponentList& components) const {
    if (v6Format_) WriteHeading(stream, "PARTS");
    for (const auto& [name, part] : model_->Parts()) {
        for (int i = 0; i < components.Length(); ++i) {
            WriteInput(stream, components.Get(i).Get().PartDefinition(name));
        }
    }
}

void oif_Builder::WritePartInstanceDefinitions(utl_Stream& stream, qkw_ComponentList& components) const {
    if (v6Format_) {
        WriteHeading(stream, "ASSEMBLY");
        // The assembly's name goes out as it stands, without quotes.
        stream << "*Assembly, name=" << model_->Model().rootAssembly().name() << endl;
    }
    for (const auto& [name, instance] : model_->Instances()) {
        for (int i = 0; i < components.Length(); ++i) {
            qkw_BuilderComponent& component = components.Get(i).Get();
            WriteOfInstance(stream, component, instance, component.InstanceDefinition(name));
        }
    }
}

void oif_Builder::WriteAssemblyDefinitions(utl_Stream& stream, qkw_ComponentList& components) const {
    for (int i = 0; i < components.Length(); ++i)
        WriteInput(stream, components.Get(i).Get().AssemblyDefinition());
}

void oif_Builder::WriteOtherModelDefinitions(utl_Stream& stream, qkw_ComponentList& components) const {
    for (int i = 0; i < components.Length(); ++i)
        WriteInput(stream, components.Get(i).Get().ModelDefinition());
}

void oif_Builder::WriteStepDefinitions(utl_Stream& stream, qkw_ComponentList& components) const {
    for (const auto& [stepName, anyStep] : model_->Steps()) {
        const nex_Context context("step", stepName);
        for (int i = 0; i < components.Length(); ++i) {
            WriteInput(stream, components.Get(i).Get().StepDefinition(stepName));
        }
        // The initial step has no load cases.
        if (stepName == model_->InitialStepName()) continue;
        const auto& step = nex_canDynamicCastRef<kprC_AnalysisStep>(anyStep, NEX_HERE);
        for (const auto& [loadCaseName, loadCase] : step.loadCases) {
            // The list of the empty key is the body.
            if (loadCaseName.IsEmpty()) continue;
            for (int i = 0; i < components.Length(); ++i) {
                WriteInput(stream, components.Get(i).Get().StepDefinition(stepName, loadCaseName));
            }
        }
    }
}
