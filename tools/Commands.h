#ifndef QRX_TOOLS_COMMANDS_H
#define QRX_TOOLS_COMMANDS_H

#include "tools/RunReport.h"

#include <string>
#include <vector>

/// What the user asked for on the command line.
struct WriteRequest {
    std::string model;
    /// The one to write of a file with several models; may be empty.
    std::string modelName;
    /// Empty: the model file's name without extension. May hold a folder, relative to the output folder; with
    /// ".inp" or without. "-": the standard output.
    std::string job;
    /// Empty: the current one.
    std::string outputDir;
    /// The deck's file as it stands, in place of both; "-": the standard output.
    std::string output;
    /// Reads the deck back and holds it against the store.
    bool verify = false;
};

struct FormatRequest {
    std::string model;
    /// Empty: the standard output. May be the model file itself.
    std::string output;
    /// Writes nothing, and names the file when it would be changed.
    bool check = false;
};

struct MeshRequest {
    std::string mesh;
    /// Arrays of cells that become groups, of formats without groups.
    std::vector<std::string> groupArrays;
    /// The mesh to take of a file with several.
    std::string part;
};

struct NewRequest {
    std::string mesh;
    /// Empty: the mesh file's name with the extension ".json", in the current folder.
    std::string output;
    /// Overwrites a file that is there.
    bool force = false;
};

/// The path of the deck; "-" for the standard output, empty for a job name that names no file.
std::string DeckTargetOf(const WriteRequest& request);
ExitCode RunWrite(const WriteRequest& request, RunReport& report);
/// The part of it behind the reading: writes the deck of a store that came from the file `modelFile`.
ExitCode WriteDeck(const odb_Odb& odb, const std::string& modelFile, const std::string& target,
                   RunReport& report);
ExitCode RunCheck(const std::string& model, const std::string& modelName, RunReport& report);
/// `history`: also what every object is in each step.
ExitCode RunInfo(const std::string& model, bool history, RunReport& report);
/// Writes the model file anew in its canonical form.
ExitCode RunFormat(const FormatRequest& request, RunReport& report);
/// The catalogue of output variables; `stepType` empty for all procedures.
ExitCode RunVariables(const std::string& stepType, RunReport& report);
/// Tells of a mesher's file.
ExitCode RunMesh(const MeshRequest& request, RunReport& report);
/// Makes a model file for a mesher's file.
ExitCode RunNew(const NewRequest& request, RunReport& report);
/// Writes the schema to the file, or to the standard output when the name is empty.
ExitCode RunSchema(const std::string& output, RunReport& report);
/// One class of the schema, or one part of a model's frame, as a table.
ExitCode RunSchemaOf(const std::string& className, RunReport& report);
/// The classes that model files know, or those of one family.
ExitCode RunClasses(const std::string& family, RunReport& report);
/// What the two take.
std::vector<std::string> ClassFamilies();
std::vector<std::string> ClassNames();

#endif
