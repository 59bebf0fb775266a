#include "amplitudes/oif_Amplitude.h"

#include "amplitudes/oif_AmplitudeBuilder.h"
#include "support/DeckTest.h"

#include <span>

namespace {

cow_2DArray<double> Table(int columns, std::span<const double> cells) {
    cow_2DArray<double> table(static_cast<int>(cells.size()) / columns, columns);
    for (int i = 0; i < table.NumRows(); ++i) {
        for (int j = 0; j < columns; ++j) {
            table.Put(i, j, cells[static_cast<std::size_t>(i * columns + j)]);
        }
    }
    return table;
}

/// Rows (0, 10), (1, 11), ...
cow_2DArray<double> Pairs(int rows) {
    std::vector<double> cells;
    for (int i = 0; i < rows; ++i) cells.insert(cells.end(), {1.0 * i, 10.0 + i});
    return Table(2, cells);
}

cow_List<double> Numbers(int count) {
    cow_List<double> list;
    for (int i = 1; i <= count; ++i) list.Append(i);
    return list;
}

template <class T>
T WithTable(int rows) {
    T record;
    record.table = Pairs(rows);
    return record;
}

/// No definition that a deck knows.
class UnknownCurve final : public cls_RecordOf<UnknownCurve, kamC_Amplitude> {
public:
    static constexpr cls_ClassInfo Class{"UnknownCurve", "a curve of a test"};
};

const cow_String kLongName(std::string(130, 'n'));

} // namespace

TEST(Amplitude, TabularWithoutSmoothing_HasNoParameterAndNoDefinition) {
    EXPECT_EQ(Written(oif_Amplitude("A", WithTable<kamC_Tabular>(1))), "*Amplitude, name=A\n"
                                                                       "0., 10.\n");
}

TEST(Amplitude, TabularWithSmoothing_WritesItAlsoWhenZero) {
    kamC_Tabular record = WithTable<kamC_Tabular>(1);
    record.smooth = 0.25;
    EXPECT_EQ(Written(oif_Amplitude("A", record)), "*Amplitude, name=A, smooth=0.25\n"
                                                   "0., 10.\n");
    record.smooth = 0.0;
    EXPECT_EQ(Written(oif_Amplitude("A", record)), "*Amplitude, name=A, smooth=0.\n"
                                                   "0., 10.\n");
}

TEST(Amplitude, TabularRows_StandFourToALine) {
    EXPECT_EQ(Written(oif_Amplitude("A", WithTable<kamC_Tabular>(4))),
              "*Amplitude, name=A\n"
              "0., 10., 1., 11., 2., 12., 3., 13.\n");
    EXPECT_EQ(Written(oif_Amplitude("A", WithTable<kamC_Tabular>(5))), "*Amplitude, name=A\n"
                                                                       "0., 10., 1., 11., 2., 12., 3., 13.\n"
                                                                       "4., 14.\n");
    EXPECT_EQ(Written(oif_Amplitude("A", WithTable<kamC_Tabular>(8))),
              "*Amplitude, name=A\n"
              "0., 10., 1., 11., 2., 12., 3., 13.\n"
              "4., 14., 5., 15., 6., 16., 7., 17.\n");
    EXPECT_EQ(Written(oif_Amplitude("A", WithTable<kamC_Tabular>(9))), "*Amplitude, name=A\n"
                                                                       "0., 10., 1., 11., 2., 12., 3., 13.\n"
                                                                       "4., 14., 5., 15., 6., 16., 7., 17.\n"
                                                                       "8., 18.\n");
}

TEST(Amplitude, NameWithBlank_IsQuoted) {
    EXPECT_EQ(Written(oif_Amplitude("my curve", kamC_Tabular())), "*Amplitude, name=\"my curve\"\n");
}

TEST(Amplitude, TotalTime_StandsBehindTheName) {
    kamC_Tabular record = WithTable<kamC_Tabular>(1);
    record.timeSpan = kamC_Amplitude::TimeSpanEnm::TOTAL;
    record.smooth = 0.1;
    EXPECT_EQ(Written(oif_Amplitude("A", record)), "*Amplitude, name=A, time=TOTAL TIME, smooth=0.1\n"
                                                   "0., 10.\n");
}

TEST(Amplitude, EmptyTableOrList_LeavesTheKeywordLineAlone) {
    EXPECT_EQ(Written(oif_Amplitude("A", kamC_Tabular())), "*Amplitude, name=A\n");
    EXPECT_EQ(Written(oif_Amplitude("A", kamC_SmoothStep())), "*Amplitude, name=A, definition=SMOOTH STEP\n");
    EXPECT_EQ(Written(oif_Amplitude("A", kamC_EquallySpaced())),
              "*Amplitude, name=A, definition=EQUALLY SPACED, fixed interval=0.\n");
}

TEST(Amplitude, PeriodicWithoutTerms_LosesItsFirstDataLineOnPurpose) {
    kamC_Periodic record;
    record.frequency = 6.5;
    EXPECT_EQ(Written(oif_Amplitude("A", record)), "*Amplitude, name=A, definition=PERIODIC\n");
}

TEST(Amplitude, EquallySpacedValues_StandEightToALine) {
    kamC_EquallySpaced record;
    record.fixedInterval = 0.5;
    const std::string head = "*Amplitude, name=A, definition=EQUALLY SPACED, fixed interval=0.5\n";
    record.values = Numbers(1);
    EXPECT_EQ(Written(oif_Amplitude("A", record)), head + "1.\n");
    record.values = Numbers(8);
    EXPECT_EQ(Written(oif_Amplitude("A", record)), head + "1., 2., 3., 4., 5., 6., 7., 8.\n");
    record.values = Numbers(9);
    EXPECT_EQ(Written(oif_Amplitude("A", record)), head + "1., 2., 3., 4., 5., 6., 7., 8.\n9.\n");
}

TEST(Amplitude, EquallySpacedParameters_ComeInOrder) {
    kamC_EquallySpaced record;
    record.timeSpan = kamC_Amplitude::TimeSpanEnm::TOTAL;
    record.smooth = 0.05;
    record.fixedInterval = 0.01;
    record.begin = -2.0;
    EXPECT_EQ(Written(oif_Amplitude("A", record)),
              "*Amplitude, name=A, time=TOTAL TIME, definition=EQUALLY SPACED, smooth=0.05, "
              "fixed interval=0.01, begin=-2.\n");
}

TEST(Amplitude, Periodic_CountsItsTermsFirst) {
    kamC_Periodic record;
    record.frequency = 31.416;
    record.start = 0.5;
    record.a0 = -1.0;
    record.table = Pairs(5);
    EXPECT_EQ(Written(oif_Amplitude("A", record)), "*Amplitude, name=A, definition=PERIODIC\n"
                                                   "5, 31.416, 0.5, -1.\n"
                                                   "0., 10., 1., 11., 2., 12., 3., 13.\n"
                                                   "4., 14.\n");
}

TEST(Amplitude, Modulated_HasFiveNumbersOnOneLine) {
    kamC_Modulated record;
    record.initial = 1.0;
    record.magnitude = 2.0;
    record.start = 0.2;
    record.frequency1 = 6.28;
    record.frequency2 = 0.628;
    EXPECT_EQ(Written(oif_Amplitude("A", record)), "*Amplitude, name=A, definition=MODULATED\n"
                                                   "1., 2., 0.2, 6.28, 0.628\n");
}

TEST(Amplitude, Decay_HasFourNumbersOnOneLine) {
    kamC_Decay record;
    record.initial = 0.1;
    record.maximum = 5.0;
    record.start = 0.2;
    record.decayTime = 3.0;
    EXPECT_EQ(Written(oif_Amplitude("A", record)), "*Amplitude, name=A, definition=DECAY\n"
                                                   "0.1, 5., 0.2, 3.\n");
}

TEST(Amplitude, SolutionDependent_WritesItsDefaultsToo) {
    EXPECT_EQ(Written(oif_Amplitude("A", kamC_SolutionDependent())),
              "*Amplitude, name=A, definition=SOLUTION DEPENDENT\n"
              "1., 0.1, 1000.\n");
}

TEST(Amplitude, SmoothStep_HasPairs) {
    EXPECT_EQ(Written(oif_Amplitude("A", WithTable<kamC_SmoothStep>(2))),
              "*Amplitude, name=A, definition=SMOOTH STEP\n"
              "0., 10., 1., 11.\n");
}

TEST(Amplitude, LongName_BreaksTheLineWhereParametersMayStand) {
    // 16 bytes before the name, 130 of the name: past the limit of 131.
    const std::string head = "*Amplitude, name=" + std::string(kLongName.View());
    EXPECT_EQ(Written(oif_Amplitude(kLongName, WithTable<kamC_Tabular>(1))), head + "\n\n0., 10.\n")
        << "a break right before the end of the line leaves an empty line";
    EXPECT_EQ(Written(oif_Amplitude(kLongName, WithTable<kamC_SmoothStep>(1))),
              head + "\n, definition=SMOOTH STEP\n0., 10.\n");
    kamC_Tabular total = WithTable<kamC_Tabular>(1);
    total.timeSpan = kamC_Amplitude::TimeSpanEnm::TOTAL;
    EXPECT_EQ(Written(oif_Amplitude(kLongName, total)), head + "\n, time=TOTAL TIME\n0., 10.\n");
}

TEST(Amplitude, LongLine_BreaksBehindTheSmoothingAndBeforeTheBegin) {
    // 17 bytes before the name; ", definition=EQUALLY SPACED" has 27, ", smooth=0.05" 13.
    kamC_EquallySpaced record;
    record.smooth = 0.05;
    record.begin = 1.0;
    const std::string shorter(75, 'n');
    EXPECT_EQ(Written(oif_Amplitude(cow_String(shorter), record)),
              "*Amplitude, name=" + shorter +
                  ", definition=EQUALLY SPACED, smooth=0.05\n, fixed interval=0., begin=1.\n");
    record.smooth = cls_UnsetDouble;
    const std::string name(69, 'n');
    EXPECT_EQ(Written(oif_Amplitude(cow_String(name), record)),
              "*Amplitude, name=" + name + ", definition=EQUALLY SPACED, fixed interval=0.\n, begin=1.\n");
}

TEST(Amplitude, RecordThatIsNoCurve_RaisesBehindTheName) {
    qio_StringDevice device;
    UnknownCurve record;
    record.timeSpan = kamC_Amplitude::TimeSpanEnm::TOTAL;
    {
        utl_Stream stream(device, 131, 6, 6);
        EXPECT_EQ(Raised([&] { oif_Amplitude("A", record).Write(stream); }), "Unknown amplitude definition");
    }
    EXPECT_EQ(device.Text(), "*Amplitude, name=A, time=TOTAL TIME");
    EXPECT_EQ(Raised([&] { Written(oif_Amplitude("A", kamC_Spectrum())); }), "Unknown amplitude definition");
}

TEST(PsdDefinition, Defaults_LeaveTheNameAlone) {
    EXPECT_EQ(Written(oif_PsdDefinition("P", kamC_PsdDefinition())), "*Psd-Definition, name=P\n");
}

TEST(PsdDefinition, AllParameters_ComeInOrder) {
    kamC_PsdDefinition record;
    record.timeSpan = kamC_Amplitude::TimeSpanEnm::TOTAL; // never written here
    record.dbReference = 2.5;
    record.g = 9.81;
    record.psdType = kamC_PsdDefinition::PsdTypeEnm::DB;
    record.user = true;
    record.table = Table(3, std::vector<double>{1.0, 0.0, 10.0, 2.0, 0.5, 20.0});
    EXPECT_EQ(Written(oif_PsdDefinition("P", record)),
              "*Psd-Definition, name=P, db Reference=2.5, g=9.81, type=DB, user\n"
              "1., 0., 10.\n"
              "2., 0.5, 20.\n");
}

TEST(PsdDefinition, TypeBase_IsWrittenAndForceIsNot) {
    kamC_PsdDefinition record;
    record.psdType = kamC_PsdDefinition::PsdTypeEnm::BASE;
    EXPECT_EQ(Written(oif_PsdDefinition("P", record)), "*Psd-Definition, name=P, type=BASE\n");
    record.psdType = kamC_PsdDefinition::PsdTypeEnm::FORCE;
    EXPECT_EQ(Written(oif_PsdDefinition("P", record)), "*Psd-Definition, name=P\n");
}

TEST(PsdDefinition, LongName_BreaksOnceBeforeTheParameters) {
    kamC_PsdDefinition record;
    record.user = true;
    EXPECT_EQ(Written(oif_PsdDefinition(kLongName, record)),
              "*Psd-Definition, name=" + std::string(kLongName.View()) + "\n, user\n");
}

TEST(PsdDefinition, RecordOfAnotherClass_WritesNothing) {
    EXPECT_EQ(Written(oif_PsdDefinition("P", kamC_Spectrum())), "");
}

TEST(Spectrum, End_IsAnEmptyLineOnPurpose) {
    kamC_Spectrum record;
    EXPECT_EQ(Written(oif_Spectrum("S", record)), "*Spectrum, name=S\n\n");
    record.table = Table(3, std::vector<double>{0.5, 10.0, 0.02});
    EXPECT_EQ(Written(oif_Spectrum("S", record)), "*Spectrum, name=S\n"
                                                  "0.5, 10., 0.02\n"
                                                  "\n");
}

TEST(Spectrum, Parameters_ComeInOrder) {
    kamC_Spectrum record;
    record.timeSpan = kamC_Amplitude::TimeSpanEnm::TOTAL; // never written here
    record.g = 9.81;
    record.type = kamC_Spectrum::TypeEnm::GRAVITY;
    EXPECT_EQ(Written(oif_Spectrum("S", record)), "*Spectrum, name=S, g=9.81, type=G\n\n");
    record.g = 0.0;
    record.type = kamC_Spectrum::TypeEnm::DISPLACEMENT;
    EXPECT_EQ(Written(oif_Spectrum("S", record)), "*Spectrum, name=S, type=DISPLACEMENT\n\n");
    record.type = kamC_Spectrum::TypeEnm::VELOCITY;
    EXPECT_EQ(Written(oif_Spectrum("S", record)), "*Spectrum, name=S, type=VELOCITY\n\n");
}

TEST(Spectrum, RecordOfAnotherClass_WritesNothing) {
    EXPECT_EQ(Written(oif_Spectrum("S", kamC_PsdDefinition())), "");
}

TEST(BaselineCorrection, Intervals_StandEightToALine) {
    kamC_BaselineCorrection record;
    EXPECT_EQ(Written(oif_BaselineCorrection(record)), "*Baseline Correction\n");
    record.intervals = Numbers(8);
    EXPECT_EQ(Written(oif_BaselineCorrection(record)), "*Baseline Correction\n"
                                                       "1., 2., 3., 4., 5., 6., 7., 8.\n");
    record.intervals = Numbers(9);
    EXPECT_EQ(Written(oif_BaselineCorrection(record)), "*Baseline Correction\n"
                                                       "1., 2., 3., 4., 5., 6., 7., 8.\n"
                                                       "9.\n");
}

namespace {

std::string BuiltText(TestStore& store) {
    oif_AmplitudeBuilder builder(store.Info());
    builder.Build();
    std::string text;
    const qkw_KeywordList keywords = builder.ModelDefinition();
    for (int i = 0; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
    return text;
}

} // namespace

TEST(AmplitudeBuilder, Amplitudes_ComeInByteOrderWithTheirOwnKeywords) {
    TestStore store;
    store.model.amplitudes.Insert("b", kamC_PsdDefinition());
    store.model.amplitudes.Insert("a", WithTable<kamC_Tabular>(1));
    store.model.amplitudes.Insert("Z", kamC_Spectrum());
    EXPECT_EQ(BuiltText(store), "*Spectrum, name=Z\n"
                                "\n"
                                "*Amplitude, name=a\n"
                                "0., 10.\n"
                                "*Psd-Definition, name=b\n");
}

TEST(AmplitudeBuilder, BaselineCorrection_FollowsTabularAndEquallySpacedAmplitudes) {
    kamC_BaselineCorrection correction;
    correction.intervals = Numbers(2);
    TestStore store;
    kamC_Tabular tabular = WithTable<kamC_Tabular>(1);
    tabular.baselineCorrection = mdl_ObjCow<kamC_BaselineCorrection>(correction);
    kamC_EquallySpaced spaced;
    spaced.baselineCorrection = mdl_ObjCow<kamC_BaselineCorrection>(kamC_BaselineCorrection());
    store.model.amplitudes.Insert("A", tabular);
    store.model.amplitudes.Insert("B", spaced);
    store.model.amplitudes.Insert("C", WithTable<kamC_SmoothStep>(1));
    EXPECT_EQ(BuiltText(store), "*Amplitude, name=A\n"
                                "0., 10.\n"
                                "*Baseline Correction\n"
                                "1., 2.\n"
                                "*Amplitude, name=B, definition=EQUALLY SPACED, fixed interval=0.\n"
                                "*Baseline Correction\n"
                                "*Amplitude, name=C, definition=SMOOTH STEP\n"
                                "0., 10.\n");
}

TEST(AmplitudeBuilder, RestartAmplitudes_AreTheNewNamesOnceEach) {
    const auto list = [](std::initializer_list<const char*> names) {
        cow_List<cow_String> result;
        for (const char* name : names) result.Append(name);
        return result;
    };
    EXPECT_EQ(oif_AmplitudeBuilder::CollectRestartAmplitudes(list({"A", "B", "A"}),
                                                             list({"C", "A", "D", "C", "B"})),
              list({"C", "D"}));
    EXPECT_EQ(oif_AmplitudeBuilder::CollectRestartAmplitudes(list({"A"}), list({})), list({}));
}

TEST(AmplitudeBuilder, AmplitudeWithAStamp_IsNewerThanTheRestartsBase) {
    TestStore store;
    kamC_Tabular record;
    store.model.amplitudes.Insert("Old", record);
    record.stamp = 1;
    store.model.amplitudes.Insert("New", record);
    const oif_AmplitudeBuilder builder(store.Info());
    EXPECT_TRUE(builder.IsNewEO("New"));
    EXPECT_FALSE(builder.IsNewEO("Old"));
    EXPECT_FALSE(builder.IsNewEO("Unknown"));
}
