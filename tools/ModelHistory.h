#ifndef QRX_TOOLS_MODELHISTORY_H
#define QRX_TOOLS_MODELHISTORY_H

#include "store_interface/model/odb_Odb.h"

#include <nlohmann/json.hpp>

#include <map>
#include <string>
#include <vector>

struct odiK_Repository;

/// What every object that lives across steps is in each step, kind by kind: its status and, for boundary
/// conditions, loads and fields, whether the step writes it and whether with op=NEW. A kind whose keywords
/// can't be told apart has the writer's failure in their place.
class ModelHistory {
public:
    struct Cell {
        mdl_PropagationStatusEnm status = mdl_PropagationStatusEnm::NOT_YET_ACTIVE;
        /// Whether the two below are known.
        bool isMarked = false;
        bool written = false;
        bool opNew = false;
    };
    struct Row {
        std::string name;
        std::string className;
        bool suppressed = false;
        std::vector<Cell> cells; // a step each
    };
    struct Failure {
        std::string member;
        std::string text;
    };

    ModelHistory(const odb_Odb& odb, const cow_String& modelName);

    nlohmann::ordered_json Json() const;
    /// For people to read, as a table for each kind that has objects.
    std::string Text() const;
    /// The same of each kind alone, by its member of the model; empty for those without objects.
    std::map<std::string, std::string> TextsByKind() const;

private:
    struct Kind {
        const odiK_Repository* repository;
        std::vector<Row> rows;
    };
    std::string TextOf(const Kind& kind) const;

    std::vector<std::string> steps_;
    std::vector<Kind> kinds_;
    std::vector<Failure> failures_;
};

#endif
