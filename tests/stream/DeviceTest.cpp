#include "foundation/qio_Device.h"
#include "foundation/utl_Stream.h"
#include "support/TestFolder.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cerrno>
#include <fstream>
#include <sstream>
#include <string>

namespace {

/// The system's calls, of which the n-th write, flush or close fails as the test asks.
struct Faults {
    int failingCall = 0; // counted over all calls but open and remove, from 1; 0 for none
    int error = 0;       // 0: a short write without a reason
    std::size_t takenBytes = 0;
    bool onward = false; // every call from failingCall on fails
    int calls = 0;

    bool Fails() {
        ++calls;
        return failingCall != 0 && (calls == failingCall || (onward && calls > failingCall));
    }
};

Faults faults;
qio_System standard;

std::FILE* RefuseToOpen(const char*, const char*) {
    errno = EACCES;
    return nullptr;
}

std::size_t FaultyWrite(const char* text, std::size_t bytes, std::FILE* file) {
    if (!faults.Fails()) return standard.write(text, bytes, file);
    const std::size_t taken = standard.write(text, std::min(bytes, faults.takenBytes), file);
    errno = faults.error;
    return taken;
}

int FaultyFlush(std::FILE* file) {
    if (!faults.Fails()) return standard.flush(file);
    errno = faults.error;
    return EOF;
}

int FaultyClose(std::FILE* file) {
    const bool fails = faults.Fails();
    const int result = standard.close(file);
    if (!fails) return result;
    errno = faults.error;
    return EOF;
}

class Device : public testing::Test {
protected:
    Device() : path_(folder_.Path("device")) {
        standard = qio_CurrentSystem();
        faults = Faults();
    }
    ~Device() override {
        qio_CurrentSystem() = standard;
    }

    static qio_System FaultySystem() {
        qio_System system = standard;
        system.write = FaultyWrite;
        system.flush = FaultyFlush;
        system.close = FaultyClose;
        return system;
    }

    static std::string Deck() {
        std::string deck;
        for (int i = 0; i < 10; ++i) deck += "line " + std::to_string(i) + "\n";
        return deck;
    }

    /// Writes the deck in ten pieces: twelve calls, with flush and close.
    void WriteDeck() const {
        qio_ios device;
        device.attach(qio_OpenFile(path_.c_str(), "w"), true);
        utl_Stream stream(device, 131, 6, 6, 1);
        for (int i = 0; i < 10; ++i) stream << cow_String("line " + std::to_string(i) + "\n");
    }

    std::string FileText() const {
        std::ifstream file(path_, std::ios::binary);
        std::ostringstream text;
        text << file.rdbuf();
        return text.str();
    }

    TestFolder folder_;
    std::string path_;
};

constexpr int kCalls = 12;

TEST_F(Device, DeckWithoutFault_ArrivesWhole) {
    const qio_SystemSwap swap(FaultySystem());
    WriteDeck();
    EXPECT_EQ(faults.calls, kCalls);
    EXPECT_EQ(FileText(), Deck());
    EXPECT_TRUE(qio_LastReport().opened);
    EXPECT_EQ(qio_LastReport().error, 0);
    EXPECT_EQ(qio_LastReport().bytes, static_cast<long long>(Deck().size()));
}

TEST_F(Device, FullDiskAtAnyCall_IsReportedAndLeavesAPrefix) {
    for (int n = 1; n <= kCalls; ++n) {
        for (const std::size_t taken : {0u, 3u}) {
            faults = {n, ENOSPC, taken, false, 0};
            const qio_SystemSwap swap(FaultySystem());
            WriteDeck();
            SCOPED_TRACE("call " + std::to_string(n));
            EXPECT_TRUE(qio_LastReport().opened);
            EXPECT_EQ(qio_LastReport().error, ENOSPC);
            const std::size_t bytes = n <= 10 ? static_cast<std::size_t>(n - 1) * 7 + taken : Deck().size();
            EXPECT_EQ(qio_LastReport().bytes, static_cast<long long>(bytes));
            EXPECT_EQ(FileText(), Deck().substr(0, bytes));
        }
    }
}

TEST_F(Device, InterruptionOfAnyWriteOrFlush_IsOvercome) {
    for (int n = 1; n < kCalls; ++n) {
        for (const std::size_t taken : {0u, 3u}) {
            faults = {n, EINTR, taken, false, 0};
            const qio_SystemSwap swap(FaultySystem());
            WriteDeck();
            EXPECT_EQ(faults.calls, kCalls + 1);
            EXPECT_EQ(qio_LastReport().error, 0);
            EXPECT_EQ(qio_LastReport().bytes, static_cast<long long>(Deck().size()));
            EXPECT_EQ(FileText(), Deck());
        }
    }
}

TEST_F(Device, InterruptedClose_HasClosedAndIsNotTriedAgain) {
    faults = {kCalls, EINTR, 0, false, 0};
    const qio_SystemSwap swap(FaultySystem());
    WriteDeck();
    EXPECT_EQ(faults.calls, kCalls);
    EXPECT_EQ(qio_LastReport().error, 0);
    EXPECT_EQ(FileText(), Deck());
}

TEST_F(Device, ShortWrites_GoOnUntilAllIsWritten) {
    faults = {1, 0, 1, true, 0};
    qio_System system = standard;
    system.write = FaultyWrite;
    const qio_SystemSwap swap(system);
    WriteDeck();
    EXPECT_EQ(faults.calls, static_cast<int>(Deck().size()));
    EXPECT_EQ(qio_LastReport().error, 0);
    EXPECT_EQ(FileText(), Deck());
}

TEST_F(Device, WriteThatTakesNothingAndGivesNoReason_IsAnInputOutputError) {
    faults = {1, 0, 0, true, 0};
    qio_System system = standard;
    system.write = FaultyWrite;
    const qio_SystemSwap swap(system);
    WriteDeck();
    EXPECT_EQ(faults.calls, 1);
    EXPECT_EQ(qio_LastReport().error, EIO);
}

TEST_F(Device, FirstOfTwoErrors_IsKept) {
    qio_ios device;
    device.attach(qio_OpenFile(path_.c_str(), "w"), true);
    const qio_SystemSwap swap(FaultySystem());
    faults = {1, ENOSPC, 0, false, 0};
    device.Write("abc", 3);
    faults = {1, EIO, 0, true, 0};
    device.Write("abc", 3);
    device.close();
    EXPECT_EQ(device.Error(), ENOSPC);
    EXPECT_EQ(qio_LastReport().error, ENOSPC);
}

TEST_F(Device, FileThatCannotBeOpened_IsReported) {
    qio_System system = standard;
    system.open = RefuseToOpen;
    const qio_SystemSwap swap(system);
    EXPECT_EQ(qio_OpenFile(path_.c_str(), "w"), nullptr);
    EXPECT_FALSE(qio_LastReport().opened);
    EXPECT_EQ(qio_LastReport().error, EACCES);
    EXPECT_EQ(qio_LastReport().bytes, 0);
}

TEST_F(Device, OpenFailureOfTheProgramsOwn_CanBeRecorded) {
    qio_RecordOpenFailure(ENOENT);
    EXPECT_FALSE(qio_LastReport().opened);
    EXPECT_EQ(qio_LastReport().error, ENOENT);
}

TEST_F(Device, Attach_OpensAndCloseEnds) {
    qio_ios device;
    EXPECT_FALSE(device.is_open());
    device.attach(qio_OpenFile(path_.c_str(), "w"), true);
    EXPECT_TRUE(device.is_open());
    device.Write("text", 4);
    EXPECT_EQ(FileText(), "text") << "the device must not hold text back";
    device.close();
    EXPECT_FALSE(device.is_open());
    EXPECT_EQ(device.Bytes(), 4);
    device.close();
    EXPECT_FALSE(device.is_open());
}

TEST_F(Device, FileOfAnotherOwner_IsFlushedAndLeftOpen) {
    std::FILE* file = std::fopen(path_.c_str(), "w");
    ASSERT_NE(file, nullptr);
    {
        qio_ios device;
        device.attach(file, false);
        device.Write("one", 3);
    }
    EXPECT_EQ(FileText(), "one");
    EXPECT_EQ(std::fputs(" two", file) >= 0, true);
    std::fclose(file);
    EXPECT_EQ(FileText(), "one two");
}

TEST_F(Device, SecondAttach_ClosesTheFileBefore) {
    qio_ios device;
    device.attach(qio_OpenFile(path_.c_str(), "w"), true);
    device.Write("one", 3);
    device.attach(nullptr, true);
    EXPECT_FALSE(device.is_open());
    EXPECT_TRUE(qio_LastReport().opened);
    EXPECT_EQ(qio_LastReport().bytes, 3);
}

TEST_F(Device, TextBehindTheClose_CountsAsLost) {
    qio_ios device;
    device.attach(qio_OpenFile(path_.c_str(), "w"), true);
    {
        utl_Stream stream(device, 131, 6, 6);
        stream << "late";
        device.close();
        EXPECT_EQ(qio_LastReport().error, 0);
    }
    EXPECT_EQ(qio_LastReport().error, EBADF);
    EXPECT_EQ(FileText(), "");
}

TEST_F(Device, FullDeviceOfTheSystem_IsReported) {
    std::FILE* full = std::fopen("/dev/full", "w");
    if (full == nullptr) GTEST_SKIP() << "no /dev/full here";
    {
        qio_ios device;
        device.attach(full, true);
        utl_Stream stream(device, 131, 6, 6);
        stream << "text";
    }
    EXPECT_EQ(qio_LastReport().error, ENOSPC);
    EXPECT_EQ(qio_LastReport().bytes, 0);
}

} // namespace
