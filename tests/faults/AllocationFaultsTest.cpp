#include "deck/oif_Writer.h"
#include "faults/FailingAllocations.h"
#include "faults/Store.h"
#include "support/TestFolder.h"
#include "whole_file/whf_File.h"

#include <gtest/gtest.h>

#include <new>

namespace {

TEST(Memory, EachAllocationFailing_LeavesTheOldDeckWholeAndNoDebris) {
    odb_Odb odb;
    FillStore(odb, 5);
    const TestFolder folder;
    const std::string target = folder.Path("job.inp");
    long long failures = 0;
    for (long long n = 1;; ++n) {
        SCOPED_TRACE("allocation " + std::to_string(n));
        folder.Put("job.inp", "** the old deck\n");
        bool happened = false;
        bool raised = false;
        {
            const FailingAllocation failing(n);
            try {
                whf_File deck(target);
                deck.Replace([&odb](qio_ostream& device) { oif_Writer(odb).WriteInput(device); });
            } catch (const std::bad_alloc&) {
                raised = true;
            }
            happened = failing.Happened();
        }
        ASSERT_EQ(raised, happened);
        ASSERT_EQ(folder.Entries(), std::vector<std::string>({"job.inp"}));
        if (!happened) break;
        ++failures;
        ASSERT_EQ(folder.Text("job.inp"), "** the old deck\n");
    }
    EXPECT_TRUE(folder.Text("job.inp").ends_with("*Plastic, rate=0.\n0.,0.\n0.,0.\n"));
    EXPECT_GT(failures, 100);
}

// A store that ran out of memory while it was completed or written must serve the next run.
TEST(Memory, FailureBefore_DoesNotShowInTheNextDeck) {
    const TestFolder folder;
    odb_Odb untouched;
    FillStore(untouched, 5);
    oif_Writer(untouched).WriteInputFile(folder.Path("expected").c_str());
    const std::string expected = folder.Text("expected.inp");
    for (long long n = 1;; ++n) {
        SCOPED_TRACE("allocation " + std::to_string(n));
        odb_Odb odb;
        FillStore(odb, 5);
        const std::string job = folder.Path("job");
        bool happened = false;
        {
            const FailingAllocation failing(n);
            try {
                oif_Writer(odb).WriteInputFile(job.c_str());
            } catch (const std::bad_alloc&) {
            }
            happened = failing.Happened();
        }
        if (!happened) break;
        oif_Writer(odb).WriteInputFile(job.c_str());
        ASSERT_EQ(folder.Text("job.inp"), expected);
    }
}

} // namespace
