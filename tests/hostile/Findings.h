#ifndef QRX_TESTS_HOSTILE_FINDINGS_H
#define QRX_TESTS_HOSTILE_FINDINGS_H

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <string_view>
#include <vector>

/// What reading the model file says: "pointer: text" for an error, "warning pointer: text" for a warning,
/// "3:14: text" for an error of syntax. "@" stands for "/models/Default Model". Fails when a store comes
/// with errors, or none without.
std::vector<std::string> Findings(std::string_view text);

/// A model file with one model of these members.
std::string Model(std::string_view members);
/// A model with one part P that has this mesh.
std::string Mesh(std::string_view members);
/// A model with parts P (two bricks, a shell, a beam and a mass; sets) and Q (without a mesh), instances I
/// and J of P and an entry E that is no part instance, assembly members, and further members of the model.
std::string Whole(std::string_view assemblyMembers, std::string_view modelMembers = {});

struct FindingCase {
    const char* name;
    std::string text;
    std::vector<std::string> findings;
};

inline void PrintTo(const FindingCase& c, std::ostream* out) {
    *out << c.text;
}

inline std::string FindingCaseName(const testing::TestParamInfo<FindingCase>& param) {
    return param.param.name;
}

#endif
