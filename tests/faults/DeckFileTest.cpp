#include "tools/DeckFile.h"

#include "deck/oif_Writer.h"
#include "faults/Store.h"
#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "support/TestFolder.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <cstring>

namespace {

using Names = std::vector<std::string>;

constexpr char kOldDeck[] = "** the old deck\n";

// System calls of which the n-th fails; n is counted over all calls of a seam, from 1.
struct Fault {
    int failing = 0;
    int error = EIO;
    int calls = 0;
    std::string name;

    bool Fails(const char* call) {
        if (++calls != failing) return false;
        name = call;
        return true;
    }
};

Fault fault;

const DeckFileSystem& Real() {
    return DeckFileSystem::Standard();
}

int Refuse() {
    errno = fault.error;
    return -1;
}

constexpr DeckFileSystem kFaultyFiles{
    [](const char* path, struct stat* found) {
        return fault.Fails("inspect") ? Refuse() : Real().inspect(path, found);
    },
    [](char* pattern) {
        if (!fault.Fails("makeFolder")) return Real().makeFolder(pattern);
        errno = fault.error;
        return static_cast<char*>(nullptr);
    },
    [](const char* path) { return fault.Fails("open") ? Refuse() : Real().open(path); },
    [](int file) { return fault.Fails("sync") ? Refuse() : Real().sync(file); },
    [](int file) {
        const bool fails = fault.Fails("close");
        const int result = Real().close(file);
        return fails ? Refuse() : result;
    },
    [](const char* from, const char* to) {
        return fault.Fails("rename") ? Refuse() : Real().rename(from, to);
    },
    [](const char* path) { return fault.Fails("remove") ? Refuse() : Real().remove(path); },
    [](const char* path) { return fault.Fails("removeFolder") ? Refuse() : Real().removeFolder(path); },
};

qio_System realDevice;

qio_System FaultyDevice() {
    qio_System device = realDevice;
    device.open = [](const char* path, const char* mode) {
        if (!fault.Fails("device open")) return realDevice.open(path, mode);
        errno = fault.error;
        return static_cast<std::FILE*>(nullptr);
    };
    device.write = [](const char* text, std::size_t bytes, std::FILE* file) {
        if (!fault.Fails("device write")) return realDevice.write(text, bytes, file);
        const std::size_t taken = realDevice.write(text, bytes / 2, file);
        errno = fault.error;
        return taken;
    };
    device.flush = [](std::FILE* file) {
        return fault.Fails("device flush") ? Refuse() : realDevice.flush(file);
    };
    device.close = [](std::FILE* file) {
        const bool fails = fault.Fails("device close");
        const int result = realDevice.close(file);
        return fails ? Refuse() : result;
    };
    return device;
}

class DeckFileTest : public testing::Test {
protected:
    DeckFileTest() {
        realDevice = qio_CurrentSystem();
        fault = Fault();
        // Large enough for several writes of the stream.
        FillStore(odb_, 12000);
    }

    void WriteTo(DeckFile& deck) {
        result_ = deck.Replace([this](const char* jobName) { oif_Writer(odb_).WriteInputFile(jobName); });
    }

    /// Whether the write succeeded; the error stands in failure_.
    bool Write(const DeckFileSystem& files, const qio_System& device) {
        const qio_SystemSwap swap(device);
        DeckFile deck(folder_.Path("job.inp"), files);
        try {
            WriteTo(deck);
            return true;
        } catch (const DeckFileError& error) {
            failure_ = error.what();
            error_ = error.Error();
            return false;
        }
    }

    std::string WholeDeck() {
        const TestFolder other;
        DeckFile deck(other.Path("job.inp"));
        WriteTo(deck);
        return other.Text("job.inp");
    }

    odb_Odb odb_;
    TestFolder folder_;
    DeckFile::Result result_;
    std::string failure_;
    int error_ = 0;
};

TEST_F(DeckFileTest, NothingFails_ReplacesTheOldDeckAndLeavesNothingElse) {
    folder_.Put("job.inp", kOldDeck);
    ASSERT_TRUE(Write(Real(), realDevice));
    const std::string deck = folder_.Text("job.inp");
    EXPECT_EQ(deck.rfind("*Heading\n**\n** PARTS\n", 0), 0U);
    EXPECT_TRUE(deck.ends_with("*Plastic, rate=0.\n0.,0.\n0.,0.\n"));
    EXPECT_EQ(result_.bytes, static_cast<long long>(deck.size()));
    EXPECT_EQ(result_.folderSyncError, 0);
    EXPECT_EQ(result_.removeError, 0);
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, EachFileCallFailing_LeavesOneWholeDeckAndNoDebris) {
    const std::string whole = WholeDeck();
    int failures = 0;
    for (int n = 1;; ++n) {
        folder_.Put("job.inp", kOldDeck);
        fault = {n, EIO, 0, ""};
        failure_.clear();
        const bool written = Write(kFaultyFiles, realDevice);
        if (fault.name.empty()) {
            EXPECT_TRUE(written);
            break;
        }
        SCOPED_TRACE("call " + std::to_string(n) + ": " + fault.name);
        ++failures;
        EXPECT_EQ(folder_.Text("job.inp"), written ? whole : kOldDeck);
        if (written) {
            // Only what comes behind the renaming may fail without harm.
            EXPECT_EQ(result_.removeError, fault.name == "removeFolder" ? EIO : 0);
            EXPECT_EQ(result_.folderSyncError, fault.name == "removeFolder" ? 0 : EIO);
        } else {
            EXPECT_EQ(error_, EIO);
            EXPECT_TRUE(failure_.ends_with(": Input/output error")) << failure_;
        }
        if (fault.name == "removeFolder") {
            ASSERT_EQ(folder_.Entries().size(), 2U);
            std::filesystem::remove(folder_.Path(folder_.Entries()[0]));
        }
        EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
    }
    // Look, make the folder, three for the file, rename, remove, three for the folder.
    EXPECT_EQ(failures, 10);
}

TEST_F(DeckFileTest, EachFileCallInterrupted_WritesTheDeck) {
    const std::string whole = WholeDeck();
    for (int n = 1;; ++n) {
        folder_.Put("job.inp", kOldDeck);
        fault = {n, EINTR, 0, ""};
        // Making a folder is never interrupted.
        const bool written = Write(kFaultyFiles, realDevice);
        if (fault.name.empty()) break;
        if (fault.name == "makeFolder") continue;
        SCOPED_TRACE("call " + std::to_string(n) + ": " + fault.name);
        EXPECT_TRUE(written);
        EXPECT_EQ(folder_.Text("job.inp"), whole);
        EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
    }
}

TEST_F(DeckFileTest, EachDeviceCallFailing_LeavesTheOldDeckWholeAndNoDebris) {
    int failures = 0;
    for (int n = 1;; ++n) {
        folder_.Put("job.inp", kOldDeck);
        fault = {n, ENOSPC, 0, ""};
        const bool written = Write(Real(), FaultyDevice());
        if (fault.name.empty()) {
            EXPECT_TRUE(written);
            break;
        }
        SCOPED_TRACE("call " + std::to_string(n) + ": " + fault.name);
        ++failures;
        EXPECT_FALSE(written);
        EXPECT_EQ(error_, ENOSPC);
        EXPECT_TRUE(failure_.ends_with(": No space left on device")) << failure_;
        EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
        EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
    }
    // Open, flush, close and at least four writes.
    EXPECT_GE(failures, 7);
}

TEST_F(DeckFileTest, DiskThatIsFull_LeavesTheOldDeckWhole) {
    folder_.Put("job.inp", kOldDeck);
    qio_System device = realDevice;
    device.open = [](const char*, const char* mode) { return realDevice.open("/dev/full", mode); };
    EXPECT_FALSE(Write(Real(), device));
    EXPECT_EQ(failure_, "cannot write the deck: No space left on device");
    EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, ReadOnlyFolder_IsRefused) {
    folder_.Put("job.inp", kOldDeck);
    fault = {2, EACCES, 0, ""};
    EXPECT_FALSE(Write(kFaultyFiles, realDevice));
    EXPECT_EQ(failure_, "cannot make a temporary folder in '" +
                            folder_.Path("").substr(0, folder_.Path("").size() - 1) + "': Permission denied");
    EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
}

TEST_F(DeckFileTest, FolderAtTheTarget_IsRefusedAndStays) {
    std::filesystem::create_directory(folder_.Path("job.inp"));
    EXPECT_FALSE(Write(Real(), realDevice));
    EXPECT_EQ(failure_, "a folder is in its place: Is a directory");
    EXPECT_TRUE(std::filesystem::is_directory(folder_.Path("job.inp")));
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, DeviceAtTheTarget_IsRefused) {
    std::filesystem::create_symlink("/dev/null", folder_.Path("job.inp"));
    EXPECT_FALSE(Write(Real(), realDevice));
    EXPECT_EQ(failure_, "something that is no file is in its place");
}

TEST_F(DeckFileTest, LinkAtTheTarget_IsReplacedAndItsFileStays) {
    folder_.Put("elsewhere", kOldDeck);
    std::filesystem::create_symlink("elsewhere", folder_.Path("job.inp"));
    ASSERT_TRUE(Write(Real(), realDevice));
    EXPECT_FALSE(std::filesystem::is_symlink(folder_.Path("job.inp")));
    EXPECT_EQ(folder_.Text("elsewhere"), kOldDeck);
}

TEST_F(DeckFileTest, FileSystemWithoutSync_IsNoFailure) {
    DeckFileSystem files = Real();
    files.sync = [](int) {
        errno = EINVAL;
        return -1;
    };
    EXPECT_TRUE(Write(files, realDevice));
    EXPECT_EQ(result_.folderSyncError, 0);
}

TEST_F(DeckFileTest, WriterRaises_LeavesTheOldDeckWholeAndPassesTheExceptionOn) {
    folder_.Put("job.inp", kOldDeck);
    DeckFile deck(folder_.Path("job.inp"));
    EXPECT_THROW(deck.Replace([this](const char* jobName) {
        oif_Writer(odb_).WriteInputFile(jobName);
        nex_Raise("no");
    }),
                 QRXBasException);
    EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, WriterThatOpensNothing_IsAFailureWhateverWasWrittenBefore) {
    ASSERT_TRUE(Write(Real(), realDevice));
    DeckFile deck(folder_.Path("other.inp"));
    EXPECT_THROW(deck.Replace([](const char*) {}), DeckFileError);
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, TargetWithoutFolder_StandsInTheCurrentOne) {
    const auto former = std::filesystem::current_path();
    std::filesystem::current_path(folder_.Path(""));
    DeckFile deck("a b.c \xC3\xA4.inp");
    WriteTo(deck);
    std::filesystem::current_path(former);
    EXPECT_EQ(folder_.Entries(), Names({"a b.c \xC3\xA4.inp"}));
}

} // namespace
