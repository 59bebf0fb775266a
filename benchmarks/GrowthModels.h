#ifndef QRX_BENCHMARKS_GROWTHMODELS_H
#define QRX_BENCHMARKS_GROWTHMODELS_H

#include <string>
#include <string_view>

// Model files that are small for what they hold, of a size that is given: each of something that could take
// far more time or memory than its text.

namespace growth {

inline std::string Join(int count, const auto& item) {
    std::string text;
    for (int i = 0; i < count; ++i) text.append(i == 0 ? "" : ",").append(item(std::to_string(i)));
    return text;
}

inline std::string Model(const std::string& members) {
    return R"({"format": "qrx-model/1", "models": {"Default Model": {)" + members + "}}}";
}

/// A part of `count` nodes and one truss between each two, with the further members of a mesh and a part.
inline std::string Part(int count, const std::string& sets, const std::string& members = {}) {
    const std::string last = std::to_string(count + 1);
    return R"("parts": {"P": {"mesh": {"nodes": {"labels": {"from": 1, "to": )" + last +
           R"(}, "coordinates": [)" +
           Join(count + 1, [](const std::string&) { return std::string("[0,0,0]"); }) +
           R"(]}, "elements": [{"type": "T3D2", "labels": {"from": 1, "to": )" + std::to_string(count) +
           R"(}, "connectivity": [)" + Join(count, [](const std::string&) { return std::string("[1,2]"); }) +
           R"(]}], "sets": [)" + sets + "]}" + members + "}}";
}

inline std::string Set(const char* kind, const std::string& i) {
    const std::string label = std::to_string(std::stoi(i) + 1);
    return R"({"name": "S)" + i + R"(", "kind": ")" + kind + R"(", "labels": [)" + label + "]}";
}

inline std::string Steps(int count) {
    return R"("steps": [{"name": "Initial", "class": "kprC_InitialStep"},)" +
           Join(count,
                [](const std::string& i) {
                    return R"({"name": "Step-)" + i + R"(", "class": "kprC_StaticStep"})";
                }) +
           "]";
}

/// Each element of a part with a section of its own.
inline std::string Sections(int count) {
    return Model(
        Part(count, Join(count, [](const std::string& i) { return Set("element", i); }),
             R"(, "sectionAssignments": [)" +
                 Join(count,
                      [](const std::string& i) {
                          return R"({"region": "S)" + i + R"(", "sectionName": "T"})";
                      }) +
                 "]") +
        R"(, "assembly": {"instances": {"I": {"part": "P"}}}, "materials": {"M": {"elastic": {"table": [[1, 0.3]]}}},
            "sections": {"T": {"class": "kseC_TrussSection", "materialName": "M", "area": 1}})");
}

/// Datums, and as many conditions that each name one.
inline std::string Datums(int count) {
    return Model(
        Part(count, R"({"name": "N", "kind": "node", "labels": [1]})") +
        R"(, "assembly": {"instances": {"I": {"part": "P"}}}, "datums": [)" +
        Join(count, [](const std::string& i) { return R"({"name": "D)" + i + R"("})"; }) +
        R"(], "steps": [{"name": "Initial", "class": "kprC_InitialStep"}], "boundaryConditions": {)" +
        Join(count,
             [](const std::string& i) {
                 return R"("B)" + i +
                        R"(": {"class": "kbcC_DisplacementBC", "region": "I.N", "localCsys": "D)" + i +
                        R"("})";
             }) +
        "}");
}

/// Instances of one part, and a set of the assembly with members in all of them.
inline std::string AssemblySet(int count) {
    return Model(
        Part(2, "") + R"(, "assembly": {"instances": {)" +
        Join(count, [](const std::string& i) { return R"("I)" + i + R"(": {"part": "P"})"; }) +
        R"(}, "sets": [{"name": "ALL", "kind": "node", "members": [)" +
        Join(count, [](const std::string& i) { return R"({"instance": "I)" + i + R"(", "labels": [1]})"; }) +
        "]}]}");
}

/// As many loads as steps, each begun in a step of its own.
inline std::string Loads(int count) {
    return Model(Part(count, Join(count, [](const std::string& i) { return Set("node", i); })) +
                 R"(, "assembly": {"instances": {"I": {"part": "P"}}},
)" + Steps(count) +
                 R"(, "loads": {)" +
                 Join(count,
                      [](const std::string& i) {
                          return R"("L)" + i + R"(": {"class": "kloC_ConcentratedForce", "region": "I.S)" +
                                 i + R"(", "states": {"Step-)" + i + R"(": {"component1": 1}}})";
                      }) +
                 "}");
}

/// Sets of a part that is shown twice.
inline std::string Sets(int count) {
    return Model(Part(count, Join(count, [](const std::string& i) { return Set("node", i); })) +
                 R"(, "assembly": {"instances": {"I": {"part": "P"}, "J": {"part": "P"}}})");
}

/// Instances of a part with a few sets.
inline std::string Instances(int count) {
    return Model(Part(20, Join(10, [](const std::string& i) { return Set("node", i); })) +
                 R"(, "assembly": {"instances": {)" +
                 Join(count, [](const std::string& i) { return R"("I)" + i + R"(": {"part": "P"})"; }) +
                 "}}");
}

/// Steps of which each changes one of a hundred loads; the others go on.
inline std::string StepsOfChanges(int count) {
    return Model(Part(100, Join(100, [](const std::string& i) { return Set("node", i); })) +
                 R"(, "assembly": {"instances": {"I": {"part": "P"}}}, )" + Steps(count) + R"(, "loads": {)" +
                 Join(100,
                      [count](const std::string& i) {
                          std::string states = R"("Step-0": {"component1": 1})";
                          for (int step = 1; step < count; ++step) {
                              if (step % 100 != std::stoi(i)) continue;
                              states += R"(, "Step-)" + std::to_string(step) + R"(": {"component1": )" +
                                        std::to_string(step) + "}";
                          }
                          return R"("L)" + i + R"(": {"class": "kloC_ConcentratedForce", "region": "I.S)" +
                                 i + R"(", "states": {)" + states + "}}";
                      }) +
                 "}");
}

/// Conditions on sets of their own, which go on through five steps.
inline std::string Conditions(int count) {
    return Model(Part(count, Join(count, [](const std::string& i) { return Set("node", i); })) +
                 R"(, "assembly": {"instances": {"I": {"part": "P"}}}, )" + Steps(5) +
                 R"(, "boundaryConditions": {)" +
                 Join(count,
                      [](const std::string& i) {
                          return R"("B)" + i + R"(": {"class": "kbcC_DisplacementBC", "region": "I.S)" + i +
                                 R"(", "states": {"Initial": {"u1": 0}}})";
                      }) +
                 "}");
}

/// One load with a state in each step.
inline std::string States(int count) {
    return Model(
        Part(1, R"({"name": "N", "kind": "node", "labels": [1]})") +
        R"(, "assembly": {"instances": {"I": {"part": "P"}}},
)" + Steps(count) +
        R"(, "loads": {"L": {"class": "kloC_ConcentratedForce", "region": "I.N", "states": {)" +
        Join(count,
             [](const std::string& i) { return R"("Step-)" + i + R"(": {"component1": )" + i + "}"; }) +
        "}}}");
}

/// Materials, and as many sections whose material was renamed.
inline std::string WrongNames(int count) {
    return Model(
        R"("materials": {)" +
        Join(count, [](const std::string& i) { return R"("Structural steel, batch )" + i + R"(": {})"; }) +
        R"(}, "sections": {)" +
        Join(count,
             [](const std::string& i) {
                 return R"("S)" + i +
                        R"(": {"class": "kseC_TrussSection", "materialName": "Structural steel, lot )" + i +
                        R"("})";
             }) +
        "}");
}

/// Instances, and as many loads on sets of one that was renamed.
inline std::string RenamedInstance(int count) {
    return Model(
        Part(1, R"({"name": "N", "kind": "node", "labels": [1]})") + R"(, "assembly": {"instances": {)" +
        Join(count, [](const std::string& i) { return R"("LEFT-BRACKET-)" + i + R"(": {"part": "P"})"; }) +
        R"(}}, "steps": [{"name": "Initial", "class": "kprC_InitialStep"}], "loads": {)" +
        Join(count,
             [](const std::string& i) {
                 return R"("L)" + i +
                        R"(": {"class": "kloC_ConcentratedForce", "region": "RIGHT-BRACKET-7.N"})";
             }) +
        "}");
}

struct Task {
    const char* name;
    std::string (*text)(int count);
    /// The size that has to be done in a second or two.
    int count;
};
inline constexpr Task kTasks[] = {
    {"Sets", Sets, 100000},
    {"Instances", Instances, 10000},
    {"Steps", StepsOfChanges, 1000},
    {"Conditions", Conditions, 100000},
    {"Sections", Sections, 32000},
    {"Datums", Datums, 30000},
    {"AssemblySet", AssemblySet, 16000},
    {"Loads", Loads, 16000},
    {"States", States, 16000},
    {"WrongNames", WrongNames, 4000},
    {"RenamedInstance", RenamedInstance, 50000},
};

} // namespace growth

#endif
