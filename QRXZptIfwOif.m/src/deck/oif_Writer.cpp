#include "deck/oif_Writer.h"

#include "deck/oif_Builder.h"
#include "deck/oif_KeptDeck.h"
#include "store_interface/model/odb_Odb.h"

void oif_Writer::WriteInputFile(const char* jobName) {
    oif_ModelInfo modelInfo(odb_.ddb().model(odb_.DeckModelName()));
    const cow_String fileName = cow_String(jobName) + ".inp";
    oif_Builder builder(modelInfo, threads_);
    builder.WriteInputFile(fileName);
}

void oif_Writer::WriteInput(qio_ostream& device) {
    oif_ModelInfo modelInfo(odb_.ddb().model(odb_.DeckModelName()));
    oif_Builder builder(modelInfo, threads_);
    builder.WriteInput(device);
}

void oif_Writer::WriteInput(oif_MeshTexts& device) {
    oif_ModelInfo modelInfo(odb_.ddb().model(odb_.DeckModelName()));
    oif_Builder builder(modelInfo);
    builder.KeepTexts(device);
    builder.WriteInput(device);
}

void oif_Writer::WriteInput(oif_MeshTexts& device, const oif_KeptDeck& kept) {
    oif_ModelInfo modelInfo(odb_.ddb().model(odb_.DeckModelName()));
    oif_Builder builder(modelInfo);
    builder.KeepTexts(device);
    builder.GoBy(kept, *odb_.DeckModel());
    builder.WriteInput(device);
}

std::unique_ptr<const oif_KeptDeck> oif_Writer::Keep(oif_MeshTexts& device) {
    oif_ModelInfo modelInfo(odb_.ddb().model(odb_.DeckModelName()));
    auto kept = std::make_unique<oif_KeptDeck>(*odb_.DeckModel());
    oif_KeptDeck::Recorder recorder(*kept, device);
    oif_Builder builder(modelInfo);
    builder.KeepTexts(recorder);
    builder.KeepDeck(*kept);
    builder.WriteInput(recorder);
    return kept;
}
