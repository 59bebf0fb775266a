#ifndef QRX_PYTHON_PYX_CLASSES_H
#define QRX_PYTHON_PYX_CLASSES_H

#include "python/pyx_Errors.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <memory>

/// A class of the store, as Python's classes are made of it.
class pyx_Class {
public:
    explicit pyx_Class(const cls_ClassEntry& entry);

    const char* Name() const { return entry_.info.name; }
    const char* Doc() const { return entry_.info.doc; }
    bool IsAbstract() const { return entry_.create == nullptr; }
    /// "" for a root.
    std::string BaseName() const;
    const std::vector<cls_Field>& Fields() const { return entry_.fields().All(); }
    /// The class of an object's states; "" for what doesn't live across steps.
    std::string StateClassName() const;
    /// A record of all defaults; null for an abstract class.
    const cls_Record* ByDefault() const { return byDefault_.get(); }

    /// The value as the model file's reader takes it, for a field that names no set, datum or record.
    py::object Checked(const cls_Field& field, py::handle value) const;

    /// Raises KeyError.
    static const pyx_Class& Get(const std::string& name);
    static const std::vector<pyx_Class>& All();

private:
    py::object Read(const cls_Field& field, py::handle value) const;

    cls_ClassEntry entry_;
    std::unique_ptr<cls_Record> byDefault_;
    std::unique_ptr<cls_Record> scratch_;
};

/// One field of a class.
struct pyx_Field {
    const pyx_Class* owner;
    const cls_Field* field;

    py::object Default() const;
    /// {"kind": ..., and by kind "enum", "class", "item", "value"}.
    py::dict Type() const;
    py::object Checked(py::handle value) const { return owner->Checked(*field, value); }
};

void pyx_AddClasses(py::module_& module);

#endif
