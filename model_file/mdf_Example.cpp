#include "model_file/mdf_Example.h"

#include "model_file/mdf_ClassChoice.h"
#include "store_interface/propagation/kprC_PropagatingObject.h"
#include "store_interface/records/steps/kprC_Step.h"

using Json = nlohmann::ordered_json;

Json mdf_ExampleOf(const cls_ClassEntry& entry) {
    const std::unique_ptr<cls_Record> record(entry.create());
    Json example = Json::object();
    if (cls_Classes().InheritanceCheck(entry.info.Id(), kprC_Step::TypeId()))
        example["name"] = entry.info.Id() == kprC_InitialStep::TypeId() ? "Initial" : "Step-1";
    example["class"] = mdf_ClassChoice::IsTwin(entry) ? entry.info.name : std::string(entry.info.Word());
    example.update(Json::parse(entry.fields().Example()));
    if (const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(record.get())) {
        const std::unique_ptr<cls_Record> state(object->NewState(0));
        example["states"] = {{"Step-1", Json::parse(state->DynFields().Example())}};
    }
    return example;
}
