#ifndef QRX_TESTS_SUPPORT_DECKTEST_H
#define QRX_TESTS_SUPPORT_DECKTEST_H

#include "base/oif_ModelInfo.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/model/odb_Odb.h"

#include <gtest/gtest.h>

#include <fstream>
#include <memory>
#include <sstream>
#include <string>

/// What a keyword writes; the same from its copy and through a buffer of one byte.
inline std::string Written(const qkw_Keyword& keyword) {
    const auto write = [](const qkw_Keyword& k, std::size_t buffer) {
        qio_StringDevice device;
        {
            utl_Stream stream(device, 131, 6, 6, buffer);
            k.Write(stream);
        }
        return device.Text();
    };
    const std::string text = write(keyword, 0);
    const std::unique_ptr<qkw_Keyword> copy(keyword.Copy());
    EXPECT_EQ(write(*copy, 0), text);
    EXPECT_EQ(write(keyword, 1), text);
    return text;
}

/// What all keywords of a list write, one after the other.
inline std::string WrittenAll(const qkw_KeywordList& keywords) {
    std::string text;
    for (int i = 0; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
    return text;
}

/// What writing through the stream gives.
template <class Action>
std::string Streamed(const Action& action) {
    qio_StringDevice device;
    {
        utl_Stream stream(device, 131, 6, 6);
        action(stream);
    }
    return device.Text();
}

/// A store with an empty "Default Model", filled by a test.
class TestStore {
public:
    TestStore() : model(odb.AddModel(odb_Odb::DefaultModelName())) {}

    ddb_Model View() { return odb.ddb().model(odb_Odb::DefaultModelName()); }
    oif_ModelInfo& Info() {
        if (info_ == nullptr) info_ = std::make_unique<oif_ModelInfo>(View());
        return *info_;
    }
    ddb_PartInstance Instance(const cow_String& name) {
        for (auto it = View().rootAssembly().instance().createIterator(); !it.isDone(); it.next()) {
            if (it.currentKey() == name) return ddb_PartInstance(it.currentValue());
        }
        throw std::logic_error("no such instance");
    }
    /// A part with a mesh of nodes at (label, 0, 0).
    odiK_Part& AddPart(const cow_String& name, const std::vector<int>& nodes) {
        odiK_Part& part = model.AddPart(name);
        part.mesh.Reset(new odiK_Mesh());
        std::vector<float> xyz;
        for (const int node : nodes) xyz.insert(xyz.end(), {static_cast<float>(node), 0.0F, 0.0F});
        part.mesh->SetNodes(nodes, xyz);
        return part;
    }

    odb_Odb odb;
    odiK_Model& model;

private:
    std::unique_ptr<oif_ModelInfo> info_;
};

/// The text that the action raises as an exception of the system; "nothing raised" when it raises none.
template <class Action>
std::string Raised(const Action& action) {
    try {
        action();
    } catch (const QRXBasException& failure) {
        return failure.what();
    }
    return "nothing raised";
}

#endif
