#include "foundation/utl_Stream.h"

#include "stream/CountedAllocations.h"

#include <gtest/gtest.h>

#include <cstring>
#include <limits>
#include <new>
#include <stdexcept>
#include <string>

namespace {

/// What `write` leaves on a deck stream, the same through a tiny buffer as through a large one.
template <class Writer>
std::string Written(Writer write) {
    std::string texts[4];
    const std::size_t sizes[4] = {0, 1, 2, 100};
    for (int i = 0; i < 4; ++i) {
        qio_StringDevice device;
        {
            utl_Stream stream(device, 131, 6, 6, sizes[i]);
            write(stream);
        }
        texts[i] = device.Text();
        EXPECT_EQ(texts[i], texts[0]) << "buffer of " << sizes[i];
    }
    return texts[0];
}

std::string Text(std::size_t length) {
    return std::string(length, 'x');
}

TEST(Stream, TextItems_GoOutAsTheyStand) {
    EXPECT_EQ(Written([](utl_Stream& s) { s << "*Part, " << cow_String("name=") << "P1\n"; }),
              "*Part, name=P1\n");
}

TEST(Stream, NullAndEmptyText_AppendNothing) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << static_cast<const char*>(nullptr) << "" << cow_String();
                  s.Print(static_cast<const char*>(nullptr));
                  s.Print(cow_String());
              }),
              "");
}

TEST(Stream, TextWithAZeroByte_IsNotCutThere) {
    const std::string text("a\0b", 3);
    EXPECT_EQ(Written([&](utl_Stream& s) { s << cow_String(text); }), text);
}

TEST(Stream, FreeNumbers_HaveNoPadding) {
    EXPECT_EQ(Written([](utl_Stream& s) { s << -12 << "," << 0 << "," << 2.5 << "," << 1.0f << "," << 1e7; }),
              "-12,0,2.5,1.,1e+07");
}

TEST(Stream, DefaultPrecisions_ServeDoubleAndFloatApart) {
    qio_StringDevice device;
    {
        utl_Stream stream(device, 131, 3, 8);
        stream << 1.0 / 3.0 << "," << 0.1f;
    }
    EXPECT_EQ(device.Text(), "0.333,0.1");
}

TEST(Stream, PrintInAField_IsRightAligned) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s.Print(17, 7);
                  s << ", ";
                  s.Print(1.25f, 12, 7);
                  s << ", ";
                  s.Print(-3.0, 12, 6);
                  s << ", ";
                  s.Print(1.0 / 3.0, 12, 15);
              }),
              "     17,         1.25,          -3., 0.333333333333333");
}

TEST(Stream, FieldWiderThanAnyBuffer_IsFilled) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << "a";
                  s.Print(5, 3000);
                  s.Print(1.5, 3000, 6);
                  s << "b";
              }),
              "a" + std::string(2999, ' ') + "5" + std::string(2997, ' ') + "1.5b");
}

TEST(Stream, LineBreakTwice_LeavesABlankLine) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << "a";
                  s.LineBreak();
                  s.LineBreak();
                  s << "b" << endl << endl;
              }),
              "a\n\nb\n\n");
}

TEST(Stream, LongText_PassesABufferItDoesNotFit) {
    const std::string text = Text(1000) + "\n" + Text(2000);
    EXPECT_EQ(Written([&](utl_Stream& s) { s << "a" << cow_String(text) << "b"; }), "a" + text + "b");
}

TEST(Stream, Flush_PassesPendingTextOnAtOnce) {
    qio_StringDevice device;
    utl_Stream stream(device, 131, 6, 6);
    stream << "pending";
    EXPECT_EQ(device.Text(), "");
    stream.Flush();
    EXPECT_EQ(device.Text(), "pending");
    stream.Flush();
    EXPECT_EQ(device.Text(), "pending");
}

TEST(Stream, BufferOfOneByte_HandsEveryItemOn) {
    qio_StringDevice device;
    utl_Stream stream(device, 131, 6, 6, 1);
    stream << "item";
    EXPECT_EQ(device.Text(), "item");
    stream << 5;
    EXPECT_EQ(device.Text(), "item5");
}

TEST(Stream, DefaultBufferSize_IsTakenByLaterStreams) {
    const std::size_t former = utl_Stream::SetDefaultBufferSize(1);
    EXPECT_EQ(former, 256u * 1024u);
    qio_StringDevice device;
    {
        utl_Stream stream(device, 131, 6, 6);
        stream << "item";
        EXPECT_EQ(device.Text(), "item");
    }
    EXPECT_EQ(utl_Stream::SetDefaultBufferSize(former), 1u);
}

TEST(Stream, ReservedRoom_TakesTextWrittenInPlace) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << "[";
                  char* out = s.Reserve(8);
                  *out++ = 'a';
                  *out++ = 'b';
                  s.Commit(out);
                  out = s.Reserve(5000);
                  for (int i = 0; i < 5000; ++i) *out++ = 'c';
                  s.Commit(out);
                  s.Commit(s.Reserve(100));
                  s << "]";
              }),
              "[ab" + std::string(5000, 'c') + "]");
}

TEST(Stream, CharactersAndTruthValues_AreNoItems) {
    const auto takes = []<class T>(T value) {
        return requires(utl_Stream & s) {
            s << value;
        };
    };
    EXPECT_TRUE(takes(1));
    EXPECT_FALSE(takes('x'));
    EXPECT_FALSE(takes(true));
}

TEST(Stream, ItemsAfterTheFirst_AllocateNothing) {
    qio_ios device;
    std::FILE* null = std::fopen("/dev/null", "w");
    ASSERT_NE(null, nullptr);
    device.attach(null, true);
    utl_Stream stream(device, 131, 6, 6, 1000);
    const cow_String name("PART-1");
    const long long before = AllocationCount();
    for (int i = 0; i < 1000; ++i) {
        stream << "*Node" << name << i << 1.0 / (i + 1) << 0.1f << endl;
        stream.Print(i, 7);
        stream.Print(1.0 / (i + 1), 12, 15);
        stream.Print(1.0f / static_cast<float>(i + 1), 12, 7);
        stream.Print(1e300 / (i + 1), 12, 17);
        stream.OptionalLineBreak();
    }
    EXPECT_EQ(AllocationCount(), before);
}

TEST(OptionalLineBreak, LineOf131Bytes_Stays) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << cow_String(Text(131));
                  s.OptionalLineBreak();
              }),
              Text(131));
}

TEST(OptionalLineBreak, LineOf132Bytes_IsEnded) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << cow_String(Text(132));
                  s.OptionalLineBreak();
                  s << "y";
                  s.OptionalLineBreak();
              }),
              Text(132) + "\ny");
}

TEST(OptionalLineBreak, EveryLengthAroundTheLimit_BreaksBeyondIt) {
    for (std::size_t length = 0; length < 300; ++length) {
        const std::string expected = "first line\n" + Text(length) + (length > 131 ? "\n" : "");
        EXPECT_EQ(Written([&](utl_Stream& s) {
                      s << "first line\n" << cow_String(Text(length));
                      s.OptionalLineBreak();
                  }),
                  expected);
    }
}

TEST(OptionalLineBreak, CountIsCarriedOverAFlush) {
    for (std::size_t before = 1; before <= 131; ++before) {
        EXPECT_EQ(Written([&](utl_Stream& s) {
                      s << "first line\n" << cow_String(Text(before));
                      s.Flush();
                      s << cow_String(Text(131 - before));
                      s.OptionalLineBreak();
                      s.Flush();
                      s << "x";
                      s.Flush();
                      s.OptionalLineBreak();
                      s << "y";
                  }),
                  "first line\n" + Text(132) + "\ny");
    }
}

TEST(OptionalLineBreak, NewlineInsideAText_StartsTheCountAnew) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << cow_String(Text(200) + "\n" + Text(131));
                  s.OptionalLineBreak();
                  s << cow_String(Text(1000) + "\n" + Text(600));
                  s.OptionalLineBreak();
              }),
              Text(200) + "\n" + Text(131) + Text(1000) + "\n" + Text(600) + "\n");
}

TEST(OptionalLineBreak, TextWithoutNewlinePastTheBuffer_Counts) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << "x" << cow_String(Text(5000));
                  s.OptionalLineBreak();
              }),
              Text(5001) + "\n");
}

TEST(OptionalLineBreak, EndedLine_Stays) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  s << cow_String(Text(500)) << "\n";
                  s.OptionalLineBreak();
              }),
              Text(500) + "\n");
}

TEST(OptionalLineBreak, LimitOfTheConstructor_IsTheOneThatCounts) {
    qio_StringDevice device;
    {
        utl_Stream stream(device, 3, 6, 6);
        stream << "abc";
        stream.OptionalLineBreak();
        stream << "d";
        stream.OptionalLineBreak();
        stream << "e";
    }
    EXPECT_EQ(device.Text(), "abcd\ne");
}

TEST(SmallReal, MagnitudeBelowTheGuard_IsZeroWithoutASign) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  const utl_StreamSmallReal guard(s, 1e-6);
                  s << 9.9e-7 << "," << -9.9e-7 << "," << 9.9e-7f << "," << -0.0 << "," << 1e-6 << "," << 2.0;
                  s.Print(-1e-7f, 12, 7);
                  s.Print(1e-7, 12, 15);
              }),
              "0.,0.,0.,0.,1e-06,2.          0.          0.");
}

TEST(SmallReal, GuardOfZero_FiltersNothing) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  const utl_StreamSmallReal guard(s, 0.0);
                  s << -0.0 << "," << 5e-324;
              }),
              "-0.,4.94066e-324");
}

TEST(SmallReal, NestedGuards_PutTheEarlierValueBack) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  {
                      const utl_StreamSmallReal outer(s, 1e-3);
                      s << 1e-2 << "," << 1e-4 << ",";
                      {
                          const utl_StreamSmallReal inner(s, 1e-1);
                          s << 1e-2 << ",";
                      }
                      s << 1e-2 << "," << 1e-4 << ",";
                  }
                  s << 1e-4;
              }),
              "0.01,0.,0.,0.01,0.,0.0001");
}

TEST(SmallReal, NotANumber_IsNoSmallReal) {
    EXPECT_EQ(Written([](utl_Stream& s) {
                  const utl_StreamSmallReal guard(s, 1.0);
                  s << std::numeric_limits<double>::quiet_NaN();
              }),
              "nan");
}

class ThrowingDevice : public qio_ostream {
public:
    void Write(const char*, std::size_t) override { throw std::bad_alloc(); }
};

TEST(Stream, DeviceThatThrows_EndsNoProgramInTheDestructor) {
    ThrowingDevice device;
    {
        utl_Stream stream(device, 131, 6, 6);
        stream << "text";
    }
    utl_Stream stream(device, 131, 6, 6);
    stream << "text";
    EXPECT_THROW(stream.Flush(), std::bad_alloc);
}

} // namespace

namespace {

/// Items of the lengths 1 to 97, each a line of a letter; `items` of them, laid out by so many threads.
std::string Items(std::size_t items, int threads, std::size_t bufferBytes = 0) {
    qio_StringDevice device;
    utl_Stream stream(device, 131, 6, 6, bufferBytes);
    stream.SetThreads(threads);
    stream << "head" << endl;
    stream.PrintItems(items, 100, [](std::size_t begin, std::size_t end, char* out) {
        for (std::size_t i = begin; i < end; ++i) {
            std::memset(out, static_cast<char>('a' + i % 26), i % 97);
            out += i % 97;
            *out++ = '\n';
        }
        return out;
    });
    stream << "tail" << endl;
    stream.Flush();
    return device.Text();
}

} // namespace

TEST(StreamItems, OfAnyNumberOfThreadsAndAnyBuffer_AreTheSameText) {
    for (const std::size_t items : {0u, 1u, 3u, 1000u, 300000u}) {
        std::string expected = "head\n";
        for (std::size_t i = 0; i < items; ++i)
            expected.append(i % 97, static_cast<char>('a' + i % 26)).append("\n");
        expected += "tail\n";
        EXPECT_EQ(Items(items, 1), expected) << items;
        EXPECT_EQ(Items(items, 1, 1), expected) << items;
        for (const int threads : {2, 3, 8})
            EXPECT_EQ(Items(items, threads), expected) << items << " " << threads;
    }
}

TEST(StreamItems, ColumnBehindThem_IsThatOfTheLastLine) {
    for (const int threads : {1, 4}) {
        qio_StringDevice device;
        utl_Stream stream(device, 5, 6, 6);
        stream.SetThreads(threads);
        stream.PrintItems(200000, 100, [](std::size_t begin, std::size_t end, char* out) {
            for (std::size_t i = begin; i < end; ++i) {
                *out++ = 'x';
                if (i % 100 == 93) *out++ = '\n';
            }
            return out;
        });
        stream.OptionalLineBreak();
        stream << "y";
        stream.Flush();
        EXPECT_EQ(device.Text().substr(device.Text().size() - 8), "xxxxxx\ny");
    }
}

TEST(StreamItems, FailureOfALayOut_ComesInItsTurnAndOfADeviceAtOnce) {
    for (const int threads : {1, 4}) {
        qio_StringDevice device;
        {
            utl_Stream stream(device, 131, 6, 6);
            stream.SetThreads(threads);
            const auto layOut = [](std::size_t begin, std::size_t end, char* out) {
                for (std::size_t i = begin; i < end; ++i) {
                    if (i == 150000) throw std::runtime_error("broken");
                    *out++ = 'x';
                }
                return out;
            };
            EXPECT_THROW(stream.PrintItems(300000, 100, layOut), std::runtime_error);
        }
        EXPECT_LE(device.Text().size(), 150000u);
        EXPECT_GE(device.Text().size(), 100000u);
    }
    class BrokenDevice final : public qio_ostream {
    public:
        void Write(const char*, std::size_t) override { throw std::runtime_error("full"); }
    } broken;
    utl_Stream stream(broken, 131, 6, 6);
    stream.SetThreads(4);
    EXPECT_THROW(stream.PrintItems(300000, 100,
                                   [](std::size_t begin, std::size_t end, char* out) {
                                       std::memset(out, 'x', end - begin);
                                       return out + (end - begin);
                                   }),
                 std::runtime_error);
}
