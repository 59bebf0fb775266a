// What several threads may do at once. The preset "tsan" builds it with the thread sanitizer, which tells of
// races that do no harm in a run.
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/qio_Device.h"
#include "foundation/thr_InOrder.h"
#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

#include <atomic>
#include <barrier>
#include <sstream>
#include <thread>

namespace {

constexpr int kThreads = 4;

std::unique_ptr<odb_Odb> Read(const std::string& example) {
    mdf_Report report;
    auto odb = mdf_ReadModelFile(QRX_PROJECT_FOLDER "/" + example, report);
    EXPECT_NE(odb, nullptr) << example;
    return odb;
}

std::string Deck(const odb_Odb& odb) {
    qio_StringDevice device;
    oif_Writer(odb).WriteInput(device);
    return device.Text();
}

/// Runs the task in all threads, as nearly at one time as can be.
template <class Task>
void AtOnce(const Task& task) {
    std::barrier begin(kThreads);
    std::vector<std::thread> threads;
    for (int i = 0; i < kThreads; ++i) {
        threads.emplace_back([&, i] {
            begin.arrive_and_wait();
            task(i);
        });
    }
    for (std::thread& thread : threads) thread.join();
}

// A part with sets that instances share, sets over several instances, and loads; not completed yet.
void Fill(odb_Odb& odb) {
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    odiK_Part& part = model.AddPart("P");
    part.mesh.Reset(new odiK_Mesh());
    part.mesh->SetNodes({1, 2, 3}, std::vector<float>(9, 1.5F));
    part.mesh->AddElements("T3D2", {1, 2}, 2, {1, 2, 2, 3});
    part.mesh->AddNodeSet("ENDS", {1, 3});
    part.mesh->AddElementSet("ALL", {1, 2});
    for (const char* name : {"I", "J", "K"}) model.AddInstance(name, "P");
    const int ends[] = {1, 3};
    const odiK_MemberInput members[] = {{"I", ends, {}}, {"J", ends, {}}, {"K", ends, {}}};
    model.AddAssemblySet("BOTH", res_SetTypeEnm::NODES, members);
    model.steps.Append("Initial", kprC_InitialStep());
}

constexpr const char* kExamples[] = {
    "examples/thermo_mechanical/thermo_mechanical.json", "examples/assembly/assembly.json",
    "examples/bolted_joint/bolted_joint.json", "examples/materials/materials.json"};

TEST(Threads, OneStoreWrittenByAll_GivesOneDeck) {
    for (const char* example : kExamples) {
        SCOPED_TRACE(example);
        const std::string expected = Deck(*Read(example));
        for (int round = 0; round < 5; ++round) {
            // Fresh, so that nothing has been worked out before.
            const auto odb = Read(example);
            std::string decks[kThreads];
            AtOnce([&](int i) { decks[i] = Deck(*odb); });
            for (const std::string& deck : decks) EXPECT_EQ(deck, expected);
        }
    }
}

TEST(Threads, LargeMesh_IsReadAndWrittenAlikeByAnyNumberOfThreads) {
    constexpr int count = 60000;
    std::string text = R"({"format": "qrx-model/1", "models": {"Default Model": {"parts": {"P": {"mesh": {
        "nodes": {"labels": [)";
    const auto list = [&](const auto& item) {
        for (int i = 0; i < count; ++i) text.append(i == 0 ? "" : ", ").append(item(i));
    };
    // No label is where its place would have it, and some coordinates are whole numbers.
    const auto label = [](int i) { return std::to_string(3 * i + 5 - i % 2); };
    list(label);
    text += R"(], "coordinates": [)";
    list([](int i) {
        return "[" + std::to_string(i) + (i % 7 == 0 ? "" : ".25") + ", " + std::to_string(i % 11) +
               ", -0.001]";
    });
    text += R"(]}, "elements": [{"type": "T3D2", "labels": [)";
    list(label);
    text += R"(], "connectivity": [)";
    list([&](int i) { return "[" + label(i) + ", " + label(i / 2) + "]"; });
    text += R"(]}], "sets": [{"name": "S", "kind": "node", "labels": [)";
    list([&](int i) { return label(i * 7919 % count); });
    text += R"(]}]}}}, "assembly": {"instances": {"I": {"part": "P"}}}}}})";
    std::string expected;
    for (const int threads : {1, 2, 5}) {
        thr_SetUsualThreads(threads);
        mdf_Report report;
        const auto odb = mdf_ReadModelText(text, "m.json", report);
        ASSERT_NE(odb, nullptr) << (report.findings.empty() ? "" : report.findings[0].Text());
        const std::string deck = Deck(*odb);
        if (threads == 1) expected = deck;
        EXPECT_TRUE(deck == expected) << threads;
    }
    thr_SetUsualThreads(0);
    EXPECT_NE(expected.find("\n      5,           0.,           0.,       -0.001\n"), std::string::npos);
    EXPECT_NE(expected.find("\n      7,         1.25,           1.,       -0.001\n"), std::string::npos);
}

TEST(Threads, LargeFileOfAMesher_GivesTheDeckOfOneThread) {
    thr_SetUsualThreads(1);
    const std::string expected = Deck(*Read("examples/bracket/bracket.json"));
    for (const int threads : {2, 5}) {
        thr_SetUsualThreads(threads);
        const auto odb = Read("examples/bracket/bracket.json");
        EXPECT_TRUE(Deck(*odb) == expected) << threads;
        // Smaller files are read by one thread.
        EXPECT_GT(odb->DeckModel()->Parts().begin()->second->mesh->Nodes().NumNodes(), 10000);
    }
    thr_SetUsualThreads(0);
}

TEST(Threads, StoreThatNobodyHasCompleted_IsCompletedOnce) {
    odb_Odb reference;
    Fill(reference);
    const std::string expected = Deck(reference);
    for (int round = 0; round < 50; ++round) {
        odb_Odb odb;
        Fill(odb);
        std::string decks[kThreads];
        AtOnce([&](int i) { decks[i] = Deck(odb); });
        for (const std::string& deck : decks) EXPECT_EQ(deck, expected);
    }
}

TEST(Threads, OneStoreReadInAllWays_StaysAsItIs) {
    const auto odb = Read(kExamples[0]);
    const std::string deck = Deck(*odb);
    std::ostringstream file;
    mdf_WriteModelFile(*odb, file);
    const std::size_t findings = dck_Check(*odb).size();
    AtOnce([&](int i) {
        for (int round = 0; round < 3; ++round) {
            switch ((i + round) % 3) {
            case 0: EXPECT_EQ(Deck(*odb), deck); break;
            case 1: EXPECT_EQ(dck_Check(*odb).size(), findings); break;
            default: {
                std::ostringstream again;
                mdf_WriteModelFile(*odb, again);
                EXPECT_EQ(again.str(), file.str());
            }
            }
        }
    });
}

TEST(Threads, StoresOfTheirOwn_DoNotDisturbEachOther) {
    std::string expected[kThreads];
    for (int i = 0; i < kThreads; ++i) expected[i] = Deck(*Read(kExamples[i]));
    std::atomic<int> right = 0;
    AtOnce([&](int i) {
        for (int round = 0; round < 3; ++round) {
            if (Deck(*Read(kExamples[i])) == expected[i]) ++right;
        }
    });
    EXPECT_EQ(right, 3 * kThreads);
}

// Records, texts and lists that threads hold copies of, each writing its own.
TEST(Threads, CopiesOfOneObject_AreEachThreadsOwn) {
    cow_Map<cow_String, cow_List<cow_String>> map;
    for (int i = 0; i < 200; ++i)
        map.Insert(cow_String(i), cow_List<cow_String>(cow_String("x"), cow_String("y")));
    const auto& shared = map;
    AtOnce([&](int i) {
        for (int round = 0; round < 200; ++round) {
            cow_Map<cow_String, cow_List<cow_String>> copy(shared);
            copy.Get(cow_String(round)).Append(cow_String(i));
            EXPECT_EQ(copy.ConstGet(cow_String(round)).Length(), 3);
            EXPECT_EQ(shared.ConstGet(cow_String(round)).Length(), 2);
        }
    });
}

} // namespace
