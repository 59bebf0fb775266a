#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/qio_Device.h"
#include "store_interface/model/odb_Odb.h"
#include "whole_file/whf_File.h"

#include <cstdio>

int main() {
    odb_Odb odb;
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    odiK_Part& part = model.AddPart("ROD");
    part.mesh.Reset(new odiK_Mesh());
    part.mesh->SetNodes({1, 2}, {0.0F, 0.0F, 0.0F, 100.0F, 0.0F, 0.0F});
    part.mesh->AddElements("T3D2", {1}, 2, {1, 2});
    model.AddInstance("ROD-1", "ROD");
    for (const fnd_Finding& finding : dck_Check(odb)) {
        std::printf("%s: %s [%s]\n", finding.place.c_str(), finding.Text().c_str(),
                    finding.code->name.data());
    }
    // The same deck, put in its place as a whole.
    const whf_File::Result result =
        whf_File("whole.inp").Replace([&odb](qio_ostream& device) { oif_Writer(odb).WriteInput(device); });
    oif_Writer(odb).WriteInputFile("consumer");
    if (result.bytes != qio_LastReport().bytes) return 1;
    // The deck's length by hand: banners, part, assembly, instance, two nodes and one element.
    std::printf("consumer.inp: %lld bytes\n", qio_LastReport().bytes);
    return qio_LastReport().opened && qio_LastReport().error == 0 ? 0 : 1;
}
