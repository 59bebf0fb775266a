#include "assembly/oif_PartBuilder.h"

#include "keyword_layer/qkw_QuorixName.h"

#include <set>

void oif_Part::Write(utl_Stream& stream) const {
    stream << "*Part, name=" << qkw_QuorixName(name_, false) << endl;
}

void oif_PartBuilder::Build() {
    if (!ModelInfo().V6Format()) return;
    std::set<cow_String> known;
    for (int i = 0; i < partsWritten_.Length(); ++i) known.insert(partsWritten_[i]);
    ForEachPartInstance([&](const cow_String&, const ddb_PartInstance& instance) {
        const cow_String& name = instance.partName();
        if (!known.insert(name).second) return;
        AddPartDefinition(name, oif_Part(name));
        partsWritten_.Append(name);
    });
}
