#include "whole_file/whf_File.h"

#include "deck/oif_Writer.h"
#include "faults/Store.h"
#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "support/TestFolder.h"
#include "whole_file/whf_SignalCleanUp.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <cstring>

#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

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

const whf_System& Real() {
    return whf_System::Standard();
}

int Refuse() {
    errno = fault.error;
    return -1;
}

constexpr whf_System kFaultyFiles{
    [](const char* path, char* buffer, std::size_t bytes) {
        return fault.Fails("readlink") ? static_cast<ssize_t>(Refuse())
                                       : Real().readlink(path, buffer, bytes);
    },
    [](int at, const char* name, int flags) {
        return fault.Fails("openFolder") ? Refuse() : Real().openFolder(at, name, flags);
    },
    [](int at, const char* name, struct stat* found) {
        return fault.Fails("inspect") ? Refuse() : Real().inspect(at, name, found);
    },
    [](int at, const char* name) { return fault.Fails("mayWrite") ? Refuse() : Real().mayWrite(at, name); },
    [](int at, const char* name) {
        return fault.Fails("makeFolder") ? Refuse() : Real().makeFolder(at, name);
    },
    [](int file, struct stat* found) {
        return fault.Fails("inspectOpen") ? Refuse() : Real().inspectOpen(file, found);
    },
    [](int file) { return fault.Fails("lock") ? Refuse() : Real().lock(file); },
    [](int at, const char* name, mode_t mode) {
        return fault.Fails("create") ? Refuse() : Real().create(at, name, mode);
    },
    [](int file) { return fault.Fails("sync") ? Refuse() : Real().sync(file); },
    [](int file, uid_t owner, gid_t group) {
        return fault.Fails("chown") ? Refuse() : Real().chown(file, owner, group);
    },
    [](int file, mode_t mode) { return fault.Fails("chmod") ? Refuse() : Real().chmod(file, mode); },
    [](int file) {
        const bool fails = fault.Fails("close");
        const int result = Real().close(file);
        return fails ? Refuse() : result;
    },
    [](int fromFolder, const char* from, int toFolder, const char* to) {
        return fault.Fails("rename") ? Refuse() : Real().rename(fromFolder, from, toFolder, to);
    },
    [](int at, const char* name) { return fault.Fails("remove") ? Refuse() : Real().remove(at, name); },
    [](int at, const char* name) {
        return fault.Fails("removeFolder") ? Refuse() : Real().removeFolder(at, name);
    },
};

qio_System realDevice;

qio_System FaultyDevice() {
    qio_System device = realDevice;
    device.write = [](const char* text, std::size_t bytes, std::FILE* file) {
        if (!fault.Fails("device write")) return realDevice.write(text, bytes, file);
        const std::size_t taken = realDevice.write(text, bytes / 2, file);
        errno = fault.error;
        return taken;
    };
    device.flush = [](std::FILE* file) {
        return fault.Fails("device flush") ? Refuse() : realDevice.flush(file);
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

    void WriteTo(whf_File& deck) {
        result_ = deck.Replace([this](qio_ostream& device) { oif_Writer(odb_).WriteInput(device); });
    }

    /// Whether the write succeeded; the error stands in failure_.
    bool Write(const whf_System& files, const qio_System& device) {
        const qio_SystemSwap swap(device);
        whf_File deck(folder_.Path("job.inp"), files);
        try {
            WriteTo(deck);
            return true;
        } catch (const whf_Error& error) {
            failure_ = error.what();
            error_ = error.Error();
            return false;
        }
    }

    std::string WholeDeck() {
        const TestFolder other;
        whf_File deck(other.Path("job.inp"));
        EXPECT_EQ(deck.Thing(), "deck");
        EXPECT_EQ(deck.TemporaryFolder(), "");
        WriteTo(deck);
        EXPECT_TRUE(deck.TemporaryFolder().starts_with(other.Path("."))) << deck.TemporaryFolder();
        return other.Text("job.inp");
    }

    odb_Odb odb_;
    TestFolder folder_;
    whf_File::Result result_;
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

TEST_F(DeckFileTest, FileThatTheDiskTakesInPieces_IsWhole) {
    std::string whole;
    whf_File deck(folder_.Path("job.inp"));
    result_ = deck.Replace([&whole](qio_ostream& device) {
        for (int i = 0; i < 37; ++i) {
            const std::string piece(std::size_t{1} << 20, static_cast<char>('A' + i));
            device.Write(piece.data(), piece.size());
            whole += piece;
        }
    });
    EXPECT_EQ(result_.bytes, 37LL << 20);
    EXPECT_TRUE(folder_.Text("job.inp") == whole);
}

TEST_F(DeckFileTest, EachFileCallFailing_LeavesOneWholeDeckAndNoDebris) {
    constexpr int callsOfARun = 19;
    const std::string whole = WholeDeck();
    std::string harmless;
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
            // Behind the renaming nothing can do harm; before it, only what can be done without.
            EXPECT_EQ(result_.removeError, fault.name == "removeFolder" ? EIO : 0);
            const bool ofFolder = fault.name == "sync" || n == callsOfARun;
            EXPECT_EQ(result_.folderSyncError, ofFolder ? EIO : 0);
            harmless += fault.name + " ";
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
    EXPECT_EQ(failures, callsOfARun);
    // Not a link; the lock, and a look at what was locked, taken again; the second try at the owner.
    EXPECT_EQ(harmless, "readlink lock inspect chown removeFolder close sync close ");
}

TEST_F(DeckFileTest, EachFileCallInterrupted_WritesTheDeck) {
    const std::string whole = WholeDeck();
    for (int n = 1;; ++n) {
        folder_.Put("job.inp", kOldDeck);
        fault = {n, EINTR, 0, ""};
        const bool written = Write(kFaultyFiles, realDevice);
        if (fault.name.empty()) break;
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
    // Flush, and at least four writes.
    EXPECT_GE(failures, 5);
}

TEST_F(DeckFileTest, DiskThatIsFull_LeavesTheOldDeckWhole) {
    folder_.Put("job.inp", kOldDeck);
    qio_System device = realDevice;
    device.write = [](const char*, std::size_t, std::FILE*) {
        errno = ENOSPC;
        return std::size_t{0};
    };
    EXPECT_FALSE(Write(Real(), device));
    EXPECT_EQ(failure_, "cannot write the deck: No space left on device");
    EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, ReadOnlyFolder_IsRefused) {
    folder_.Put("job.inp", kOldDeck);
    fault = {5, EACCES, 0, ""};
    EXPECT_FALSE(Write(kFaultyFiles, realDevice));
    EXPECT_EQ(failure_, "cannot make a temporary folder in '" + folder_.Path() + "': Permission denied");
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

TEST_F(DeckFileTest, LinkAtTheTarget_StaysAndItsFileIsReplaced) {
    std::filesystem::create_directory(folder_.Path("far"));
    folder_.Put("far/deck", kOldDeck);
    std::filesystem::create_symlink("far/deck", folder_.Path("middle"));
    std::filesystem::create_symlink(folder_.Path("middle"), folder_.Path("job.inp"));
    ASSERT_TRUE(Write(Real(), realDevice));
    EXPECT_TRUE(std::filesystem::is_symlink(folder_.Path("job.inp")));
    EXPECT_FALSE(std::filesystem::is_symlink(folder_.Path("far/deck")));
    EXPECT_EQ(folder_.Text("far/deck"), WholeDeck());
    EXPECT_EQ(folder_.Entries(), Names({"far", "job.inp", "middle"}));
}

TEST_F(DeckFileTest, LinkToNothing_MakesWhatItPointsTo) {
    std::filesystem::create_symlink("elsewhere", folder_.Path("job.inp"));
    ASSERT_TRUE(Write(Real(), realDevice));
    EXPECT_EQ(folder_.Text("elsewhere"), WholeDeck());
}

TEST_F(DeckFileTest, LinksInARing_AreRefused) {
    std::filesystem::create_symlink("b", folder_.Path("job.inp"));
    std::filesystem::create_symlink("job.inp", folder_.Path("b"));
    EXPECT_FALSE(Write(Real(), realDevice));
    EXPECT_EQ(error_, ELOOP);
}

TEST_F(DeckFileTest, LinkOfAnotherUserWhereAllMayWrite_IsNotFollowed) {
    folder_.Put("precious", kOldDeck);
    std::filesystem::create_symlink("precious", folder_.Path("job.inp"));
    static bool isSticky = false;
    whf_System files = Real();
    files.inspect = [](int at, const char* name, struct stat* found) {
        const int result = Real().inspect(at, name, found);
        if (S_ISLNK(found->st_mode)) found->st_uid = 4711;
        if (S_ISDIR(found->st_mode)) found->st_mode |= isSticky ? 01002 : 0;
        return result;
    };
    isSticky = true;
    EXPECT_FALSE(Write(files, realDevice));
    EXPECT_EQ(error_, EACCES);
    EXPECT_EQ(folder_.Text("precious"), kOldDeck);
    isSticky = false;
    EXPECT_TRUE(Write(files, realDevice));
    EXPECT_EQ(folder_.Text("precious"), WholeDeck());
}

TEST_F(DeckFileTest, OtherHardLinks_KeepTheOldDeck) {
    folder_.Put("job.inp", kOldDeck);
    std::filesystem::create_hard_link(folder_.Path("job.inp"), folder_.Path("other"));
    ASSERT_TRUE(Write(Real(), realDevice));
    EXPECT_EQ(folder_.Text("other"), kOldDeck);
    EXPECT_EQ(folder_.Text("job.inp"), WholeDeck());
}

struct stat StatOf(const std::string& path) {
    struct stat found = {};
    EXPECT_EQ(::stat(path.c_str(), &found), 0);
    return found;
}

TEST_F(DeckFileTest, ReplacedDeck_KeepsItsMode) {
    for (const mode_t mode : {0600, 0640, 0664, 0666, 0755}) {
        folder_.Put("job.inp", kOldDeck);
        ASSERT_EQ(::chmod(folder_.Path("job.inp").c_str(), mode), 0);
        ASSERT_TRUE(Write(Real(), realDevice));
        EXPECT_EQ(StatOf(folder_.Path("job.inp")).st_mode & 07777, mode);
    }
}

TEST_F(DeckFileTest, NewDeck_HasTheModeOfAnyNewFile) {
    const mode_t former = ::umask(027);
    EXPECT_TRUE(Write(Real(), realDevice));
    ::umask(former);
    EXPECT_EQ(StatOf(folder_.Path("job.inp")).st_mode & 07777, 0640U);
}

TEST_F(DeckFileTest, GroupThatCannotBeKept_GivesTheNewOneNoMoreThanAllHave) {
    whf_System files = Real();
    files.chown = [](int, uid_t, gid_t) {
        errno = EPERM;
        return -1;
    };
    const std::pair<mode_t, mode_t> modes[] = {{0660, 0600}, {0664, 0644}, {0644, 0644}, {0666, 0666}};
    for (const auto& [old, expected] : modes) {
        folder_.Put("job.inp", kOldDeck);
        ASSERT_EQ(::chmod(folder_.Path("job.inp").c_str(), old), 0);
        ASSERT_TRUE(Write(files, realDevice));
        EXPECT_EQ(StatOf(folder_.Path("job.inp")).st_mode & 07777, expected);
    }
}

TEST_F(DeckFileTest, OwnerAndGroup_AreAskedForAsTheyWere) {
    folder_.Put("job.inp", kOldDeck);
    static std::vector<std::pair<uid_t, gid_t>> asked;
    asked.clear();
    whf_System files = Real();
    files.inspect = [](int at, const char* name, struct stat* found) {
        const int result = Real().inspect(at, name, found);
        if (std::string_view(name) == "job.inp") {
            found->st_uid = 4711;
            found->st_gid = 4712;
        }
        return result;
    };
    files.chown = [](int, uid_t owner, gid_t group) {
        asked.emplace_back(owner, group);
        if (asked.size() > 1) return 0;
        errno = EPERM;
        return -1;
    };
    ASSERT_TRUE(Write(files, realDevice));
    EXPECT_EQ(asked, (std::vector<std::pair<uid_t, gid_t>>{{4711, 4712}, {static_cast<uid_t>(-1), 4712}}));
}

TEST_F(DeckFileTest, DeckThatMayNotBeWritten_IsRefused) {
    folder_.Put("job.inp", kOldDeck);
    fault = {4, EACCES, 0, ""};
    EXPECT_FALSE(Write(kFaultyFiles, realDevice));
    EXPECT_EQ(fault.name, "mayWrite");
    EXPECT_EQ(failure_, "the file in its place may not be written: Permission denied");
    EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
}

// Somebody who may write to the folder puts a link in the place of the fresh one.
TEST_F(DeckFileTest, FoldersOfFilesThatAreWrittenAtOnce_AreAllRemovedAtASignal) {
    const TestFolder folder;
    whf_File first(folder.Path("first.inp"));
    whf_File second(folder.Path("second.inp"));
    std::vector<std::string> during;
    std::vector<std::string> left{"not looked at"};
    const auto writeBoth = [&](qio_ostream&) {
        second.Replace([&](qio_ostream&) {
            during = folder.Entries();
            whf_SignalCleanUp::Remove();
            left = folder.Entries();
        });
    };
    EXPECT_THROW(first.Replace(writeBoth), whf_Error);
    EXPECT_EQ(during.size(), 2U);
    EXPECT_EQ(left, std::vector<std::string>());
    EXPECT_EQ(folder.Entries(), std::vector<std::string>());
    // Their places serve the next ones.
    for (int i = 0; i < 2 * whf_SignalCleanUp::kMost; ++i)
        whf_File(folder.Path("next.inp")).Replace([](qio_ostream& device) { device.Write("x", 1); });
    EXPECT_EQ(folder.Entries(), std::vector<std::string>({"next.inp"}));
}

TEST_F(DeckFileTest, LinkInThePlaceOfTheFreshFolder_IsNotFollowed) {
    std::filesystem::create_directory(folder_.Path("trap"));
    static std::string trap;
    trap = folder_.Path("trap");
    whf_System files = Real();
    files.makeFolder = [](int at, const char* name) {
        const int made = Real().makeFolder(at, name);
        if (made == 0 && ::renameat(at, name, at, "away") == 0) return ::symlinkat(trap.c_str(), at, name);
        return made;
    };
    EXPECT_FALSE(Write(files, realDevice));
    EXPECT_TRUE(std::filesystem::is_empty(trap));
}

TEST_F(DeckFileTest, FreshFolderThatAnotherRunTidiesAway_IsMadeAnew) {
    static int tidied;
    tidied = 0;
    whf_System files = Real();
    files.makeFolder = [](int at, const char* name) {
        const int made = Real().makeFolder(at, name);
        if (made == 0 && ++tidied <= 2) return Real().removeFolder(at, name);
        return made;
    };
    EXPECT_TRUE(Write(files, realDevice));
    EXPECT_EQ(tidied, 3);
    EXPECT_EQ(folder_.Entries(), std::vector<std::string>({"job.inp"}));
}

TEST_F(DeckFileTest, LinkThatComesLater_DoesNotRedirectTheDeck) {
    folder_.Put("job.inp", kOldDeck);
    std::filesystem::create_directory(folder_.Path("trap"));
    static std::string folder;
    folder = folder_.Path();
    whf_System files = Real();
    files.create = [](int at, const char* name, mode_t mode) {
        for (const auto& entry : std::filesystem::directory_iterator(folder)) {
            if (!entry.path().filename().string().starts_with(".qrxdeck-")) continue;
            const std::filesystem::path former = entry.path();
            std::filesystem::rename(former, folder + "/away");
            std::filesystem::create_directory_symlink(folder + "/trap", former);
            break;
        }
        return Real().create(at, name, mode);
    };
    ASSERT_TRUE(Write(files, realDevice));
    EXPECT_TRUE(std::filesystem::is_empty(folder_.Path("trap")));
    EXPECT_EQ(folder_.Text("job.inp"), WholeDeck());
}

TEST_F(DeckFileTest, FileThatIsThereAlready_IsNotWrittenTo) {
    folder_.Put("precious", kOldDeck);
    static std::string precious;
    precious = folder_.Path("precious");
    whf_System files = Real();
    files.create = [](int at, const char* name, mode_t mode) {
        EXPECT_EQ(::symlinkat(precious.c_str(), at, name), 0);
        return Real().create(at, name, mode);
    };
    EXPECT_FALSE(Write(files, realDevice));
    EXPECT_EQ(error_, EEXIST);
    EXPECT_EQ(folder_.Text("precious"), kOldDeck);
}

TEST_F(DeckFileTest, WhatAKilledRunLeft_IsRemovedByTheNext) {
    std::filesystem::create_directory(folder_.Path(".qrxdeck-0a1b2c"));
    std::filesystem::create_directory(folder_.Path(".qrxdeck-empty"));
    folder_.Put(".qrxdeck-0a1b2c/deck.inp", "half a deck");
    for (const char* name : {".qrxdeck-0a1b2c", ".qrxdeck-empty"}) {
        ASSERT_EQ(::chmod(folder_.Path(name).c_str(), 0700), 0);
    }
    ASSERT_TRUE(Write(Real(), realDevice));
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, FolderOfARunThatLives_Stays) {
    std::filesystem::create_directory(folder_.Path(".qrxdeck-0a1b2c"));
    ASSERT_EQ(::chmod(folder_.Path(".qrxdeck-0a1b2c").c_str(), 0700), 0);
    folder_.Put(".qrxdeck-0a1b2c/deck.inp", "half a deck");
    // As if long ago: age doesn't count.
    std::filesystem::last_write_time(folder_.Path(".qrxdeck-0a1b2c"), std::filesystem::file_time_type());
    const int other = ::open(folder_.Path(".qrxdeck-0a1b2c").c_str(), O_RDONLY | O_DIRECTORY);
    ASSERT_EQ(::flock(other, LOCK_EX | LOCK_NB), 0);
    EXPECT_TRUE(Write(Real(), realDevice));
    EXPECT_EQ(folder_.Entries(), Names({".qrxdeck-0a1b2c", "job.inp"}));
    EXPECT_EQ(folder_.Text(".qrxdeck-0a1b2c/deck.inp"), "half a deck");
    ::close(other);
}

TEST_F(DeckFileTest, HiddenThingsThatAreNoLeavings_Stay) {
    folder_.Put(".qrxdeck-file", "x");
    std::filesystem::create_directory(folder_.Path("trap"));
    folder_.Put("trap/deck.inp", "x");
    std::filesystem::create_directory_symlink("trap", folder_.Path(".qrxdeck-link"));
    std::filesystem::create_directory(folder_.Path(".qrxdeck-open"));
    ASSERT_EQ(::chmod(folder_.Path(".qrxdeck-open").c_str(), 0755), 0);
    ASSERT_TRUE(Write(Real(), realDevice));
    EXPECT_EQ(folder_.Entries(),
              Names({".qrxdeck-file", ".qrxdeck-link", ".qrxdeck-open", "job.inp", "trap"}));
    EXPECT_EQ(folder_.Text("trap/deck.inp"), "x");
}

TEST_F(DeckFileTest, NothingIsToldAfterTheRenaming_WhatTellsMayStillRefuse) {
    folder_.Put("job.inp", kOldDeck);
    whf_File deck(folder_.Path("job.inp"));
    long long told = 0;
    const auto write = [this](qio_ostream& device) { oif_Writer(odb_).WriteInput(device); };
    EXPECT_THROW(deck.Replace(write,
                              [&](long long bytes) {
                                  told = bytes;
                                  EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
                                  throw std::runtime_error("the report is lost");
                              }),
                 std::runtime_error);
    EXPECT_EQ(told, static_cast<long long>(WholeDeck().size()));
    EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, FileSystemWithoutSync_IsNoFailure) {
    whf_System files = Real();
    files.sync = [](int) {
        errno = EINVAL;
        return -1;
    };
    EXPECT_TRUE(Write(files, realDevice));
    EXPECT_EQ(result_.folderSyncError, 0);
}

TEST_F(DeckFileTest, WriterRaises_LeavesTheOldDeckWholeAndPassesTheExceptionOn) {
    folder_.Put("job.inp", kOldDeck);
    whf_File deck(folder_.Path("job.inp"));
    EXPECT_THROW(deck.Replace([this](qio_ostream& device) {
        oif_Writer(odb_).WriteInput(device);
        nex_Raise("no");
    }),
                 QRXBasException);
    EXPECT_EQ(folder_.Text("job.inp"), kOldDeck);
    EXPECT_EQ(folder_.Entries(), Names({"job.inp"}));
}

TEST_F(DeckFileTest, TargetWithoutFolder_StandsInTheCurrentOne) {
    const auto former = std::filesystem::current_path();
    std::filesystem::current_path(folder_.Path(""));
    whf_File deck("a b.c \xC3\xA4.inp");
    WriteTo(deck);
    std::filesystem::current_path(former);
    EXPECT_EQ(folder_.Entries(), Names({"a b.c \xC3\xA4.inp"}));
}

} // namespace
