#ifndef QRX_STORE_CLS_FIELDTABLE_H
#define QRX_STORE_CLS_FIELDTABLE_H

#include "foundation/cow_2DArray.h"
#include "foundation/cow_Map.h"
#include "foundation/gsl_Geometry.h"
#include "foundation/omi_complex.h"
#include "foundation/omu_PrimEnum.h"
#include "store_interface/records/cls_Record.h"

#include <limits>
#include <span>
#include <string>
#include <vector>

/// The markers of fields without a value.
inline constexpr double cls_UnsetDouble = std::numeric_limits<double>::max();
inline constexpr int cls_UnsetInt = std::numeric_limits<int>::max();

/// How a field's value is built. The kind tells which class a cls_FieldType is.
enum class cls_FieldKind {
    Bool,
    Int,
    Double,
    Float,
    String,
    Enum,      ///< cls_EnumType
    Triple,    ///< a gsl_Point, gsl_Vector or g3d_Vector: cls_TripleType
    Segment,   ///< gsl_ModelSegment
    Complex,   ///< omi_complex
    Table,     ///< rows of doubles: cls_TableType
    List,      ///< cls_ListType
    Map,       ///< by name: cls_MapType
    Record,    ///< one record, always there: cls_HolderType
    Optional,  ///< one record, or none: cls_HolderType
    Variant,   ///< a record of any class derived from one, or none: cls_HolderType
    Region,    ///< rgnC_Region
    Datum,     ///< dtmC_DatumRef
    Attribute, ///< a value with a state, in per-step states: cls_AttributeType
    Tree,      ///< a part of the model's tree: cls_TreeType
};

/// The parts of a model's tree that the tables of its frame name. What is no record has a reader, a writer
/// and a shape in the schema of its own.
enum class cls_TreeEnm {
    Datums,
    Parts,
    Assembly,
    Instances,
    Mesh,
    AssemblyMesh,
    AssemblySets,
    Attributes,         ///< on sets of the mesh, by name: std::vector<odiK_AttributeInput>
    OwnAttributes,      ///< the same of an instance, where none is the part's: std::optional of it
    AssemblyAttributes, ///< on regions: ptoC_PartAttributeList
};

/// A type of fields, for code that works on every record: one object per C++ type.
/// `value` is always the address of a value of just this type.
class cls_FieldType {
public:
    explicit cls_FieldType(cls_FieldKind kind) : kind_(kind) {}
    virtual ~cls_FieldType() = default;
    cls_FieldKind Kind() const { return kind_; }
    virtual bool Equal(const void* a, const void* b) const = 0;
    virtual void Assign(void* to, const void* from) const = 0;

private:
    cls_FieldKind kind_;
};

class cls_EnumType : public cls_FieldType {
public:
    explicit cls_EnumType(const omu_EnumTable& table) : cls_FieldType(cls_FieldKind::Enum), table_(&table) {}
    const omu_EnumTable& Table() const { return *table_; }
    virtual int Get(const void* value) const = 0;
    virtual void Set(void* value, int number) const = 0;

private:
    const omu_EnumTable* table_;
};

class cls_TripleType : public cls_FieldType {
public:
    cls_TripleType() : cls_FieldType(cls_FieldKind::Triple) {}
    virtual void Get(const void* value, double (&xyz)[3]) const = 0;
    virtual void Set(void* value, const double (&xyz)[3]) const = 0;
    /// Whether it holds its numbers in single precision.
    virtual bool IsSingle() const { return false; }
};

class cls_TableType : public cls_FieldType {
public:
    cls_TableType() : cls_FieldType(cls_FieldKind::Table) {}
    virtual const cow_2DArray<double>& Get(const void* value) const = 0;
    virtual void Set(void* value, const cow_2DArray<double>& cells) const = 0;
};

class cls_ListType : public cls_FieldType {
public:
    explicit cls_ListType(const cls_FieldType& item) : cls_FieldType(cls_FieldKind::List), item_(&item) {}
    const cls_FieldType& ItemType() const { return *item_; }
    virtual int Length(const void* value) const = 0;
    virtual const void* Item(const void* value, int index) const = 0;
    virtual void* WritableItem(void* value, int index) const = 0;
    virtual void Clear(void* value) const = 0;
    /// Appends a default item and gives its address.
    virtual void* Append(void* value) const = 0;

private:
    const cls_FieldType* item_;
};

class cls_MapType : public cls_FieldType {
public:
    explicit cls_MapType(const cls_FieldType& item) : cls_FieldType(cls_FieldKind::Map), item_(&item) {}
    const cls_FieldType& ItemType() const { return *item_; }
    /// In ascending byte order.
    virtual cow_List<cow_String> Keys(const void* value) const = 0;
    virtual const void* Item(const void* value, const cow_String& key) const = 0;
    virtual void Clear(void* value) const = 0;
    /// The item of the key, a default one at its first use. Holders of records start empty.
    virtual void* Insert(void* value, const cow_String& key) const = 0;

private:
    const cls_FieldType* item_;
};

class cls_HolderType : public cls_FieldType {
public:
    cls_HolderType(cls_FieldKind kind, unsigned (*classId)()) : cls_FieldType(kind), classId_(classId) {}
    /// The class of the record, for a variant the one that its record must derive from.
    unsigned ClassId() const { return classId_(); }
    /// Null when there is none.
    virtual const cls_Record* Get(const void* value) const = 0;
    /// The record for writing; null when there is none.
    virtual cls_Record* Writable(void* value) const = 0;
    /// Stores a copy; the record must be of the class or, for a variant, derive from it. Null takes the
    /// record away.
    virtual void Set(void* value, const cls_Record* record) const = 0;

private:
    unsigned (*classId_)();
};

class cls_AttributeType : public cls_FieldType {
public:
    explicit cls_AttributeType(const cls_FieldType& valueType)
        : cls_FieldType(cls_FieldKind::Attribute), valueType_(&valueType) {}
    const cls_FieldType& ValueType() const { return *valueType_; }
    virtual int State(const void* attribute) const = 0;
    virtual void SetState(void* attribute, int state) const = 0;
    virtual const void* Value(const void* attribute) const = 0;
    virtual void* WritableValue(void* attribute) const = 0;
    /// Makes it a default one, never set.
    virtual void Reset(void* attribute) const = 0;

private:
    const cls_FieldType* valueType_;
};

class cls_TreeType : public cls_FieldType {
public:
    explicit cls_TreeType(cls_TreeEnm part) : cls_FieldType(cls_FieldKind::Tree), part_(part) {}
    cls_TreeEnm Part() const { return part_; }
    /// Parts of the tree are never compared or copied as fields.
    bool Equal(const void* a, const void* b) const override { return a == b; }
    void Assign(void*, const void*) const override {}
    template <cls_TreeEnm Part>
    static const cls_FieldType& Instance() {
        static const cls_TreeType type(Part);
        return type;
    }

private:
    cls_TreeEnm part_;
};

/// The field type of the C++ type T; specialised for all types that records have members of.
template <class T, class Enable = void>
struct cls_TypeOf;

/// A meaning of a number in an int field without an enumeration of its own.
struct cls_IntMeaning {
    int value;
    const char* word;
};

/// What a predefined behaviour of a per-step attribute in the base state of a perturbation step is: see
/// mdl_Propagation.
enum class cls_BaseStateRule { Carried, ZeroValue, Dropped };

/// One field of a record class.
struct cls_Field {
    const char* name;
    const char* doc;
    const cls_FieldType* type;
    void* (*access)(cls_Record& record);

    /// For a text that is a name and must be able to stand in a deck: what it names ("part"), or "".
    const char* nameOf = nullptr;
    /// For a text that is one of a few words, in any capitals: these.
    std::span<const char* const> words;
    /// For an enumeration: model files give it by its words alone, not by its numbers.
    bool wordsOnly = false;
    /// For a triple of reals: each must be a number of single precision, although held in double.
    bool singlePrecision = false;
    /// For a text field: the kind of object that it names ("amplitude", "material", ...), else null.
    const char* refersTo = nullptr;
    /// The class that the named object must be of or derive from; null: any of its kind.
    const cls_ClassInfo* refersToClass = nullptr;
    /// For an int field: what its numbers mean.
    std::span<const cls_IntMeaning> meanings;
    /// For a list: its only permitted length, or 0.
    int length = 0;
    /// For a list of reals that counts by position: the list that holds where a model file says nothing. An
    /// item given as null is the item of the same place; a list too short goes on with its tail.
    cow_List<double> (*defaultItems)(const cls_Record& record) = nullptr;
    /// For a text that the deck takes as it stands, with whatever keywords are in it: a model file may give
    /// it line by line.
    bool verbatim = false;
    /// For a text that may run over several lines: no keyword line is made of it.
    bool freeText = false;
    /// For a region of nodes: a model file may give several, which are taken together.
    bool mayBeSeveral = false;
    /// Absent or empty is an error of a model file.
    bool required = false;
    /// Filled by the store or a program, never by a model file.
    bool notModelData = false;
    /// For numbers: what they are measured in ("force/length"), "no unit" for bare ones; else null.
    const char* unit = nullptr;
    /// Why no deck ever tells of the field, with what to do instead; null for fields that decks tell of.
    const char* notInDeck = nullptr;
    cls_BaseStateRule baseState = cls_BaseStateRule::Carried;

    /// What it is for, with the unit: "thickness of the layer (length)".
    std::string Documentation() const;

    /// Null for a part of the tree that is no member of the record.
    const void* In(const cls_Record& record) const { return access(const_cast<cls_Record&>(record)); }
    void* In(cls_Record& record) const { return access(record); }
};

/// All fields of a class, those of its base first.
class cls_FieldTable {
public:
    const std::vector<cls_Field>& All() const { return fields_; }
    const cls_Field* Find(std::string_view name) const;
    /// A JSON object; empty for a class that has said nothing.
    const char* Example() const { return example_; }

protected:
    std::vector<cls_Field> fields_;
    const char* example_ = "{}";
};

/// Makes the field table of the record class C:
///     cls_Describe<kprC_Step>(cls_Record::Fields())
///         .Field<&kprC_Step::description>("description", "free text of the step");
/// The options below apply to the field that was declared last.
template <class C>
class cls_Describe : public cls_FieldTable {
public:
    explicit cls_Describe(const cls_FieldTable& base) { fields_ = base.All(); }

    template <auto Member>
    cls_Describe& Field(const char* name, const char* doc) {
        using Value = std::remove_reference_t<decltype(std::declval<C&>().*Member)>;
        cls_Field field{};
        field.name = name;
        field.doc = doc;
        field.type = &cls_TypeOf<Value>::Instance();
        field.access = [](cls_Record& record) -> void* { return &(static_cast<C&>(record).*Member); };
        fields_.push_back(field);
        return *this;
    }
    /// A part of the tree that is in the record: a member of it, or what a function gives of it.
    template <auto Member, cls_TreeEnm Part>
    cls_Describe& Tree(const char* name, const char* doc) {
        Tree<Part>(name, doc);
        fields_.back().access = [](cls_Record& record) -> void* {
            if constexpr (std::is_member_object_pointer_v<decltype(Member)>) {
                return &(static_cast<C&>(record).*Member);
            } else {
                return &Member(static_cast<C&>(record));
            }
        };
        return *this;
    }
    /// A part of the tree that stands elsewhere.
    template <cls_TreeEnm Part>
    cls_Describe& Tree(const char* name, const char* doc) {
        cls_Field field{};
        field.name = name;
        field.doc = doc;
        field.type = &cls_TreeType::Instance<Part>();
        field.access = [](cls_Record&) -> void* { return nullptr; };
        fields_.push_back(field);
        return *this;
    }
    /// The class of the records in a part of the tree.
    template <class T>
    cls_Describe& Of() {
        fields_.back().refersToClass = &T::Class;
        return *this;
    }
    cls_Describe& NameOf(const char* kind) {
        fields_.back().nameOf = kind;
        return *this;
    }
    cls_Describe& Words(std::span<const char* const> words) {
        fields_.back().words = words;
        return *this;
    }
    cls_Describe& WordsOnly() {
        fields_.back().wordsOnly = true;
        return *this;
    }
    cls_Describe& SinglePrecision() {
        fields_.back().singlePrecision = true;
        return *this;
    }
    /// Lets `describe` declare fields here, for groups of fields that many classes have.
    template <class Describe>
    cls_Describe& With(const Describe& describe) {
        describe(*this);
        return *this;
    }
    cls_Describe& RefersTo(const char* kind) {
        fields_.back().refersTo = kind;
        return *this;
    }
    /// To an object of class T.
    template <class T>
    cls_Describe& RefersTo(const char* kind) {
        fields_.back().refersToClass = &T::Class;
        return RefersTo(kind);
    }
    /// Narrows what a field of the base refers to.
    template <class T>
    cls_Describe& InheritedRefersTo(std::string_view name) {
        for (cls_Field& field : fields_) {
            if (name == field.name) field.refersToClass = &T::Class;
        }
        return *this;
    }
    cls_Describe& Meanings(std::span<const cls_IntMeaning> meanings) {
        fields_.back().meanings = meanings;
        return *this;
    }
    cls_Describe& Length(int length) {
        fields_.back().length = length;
        return *this;
    }
    cls_Describe& Unit(const char* unit) {
        fields_.back().unit = unit;
        return *this;
    }
    /// What a model file may say of a record of the class, as a JSON object; for all fields at once.
    cls_Describe& Example(const char* json) {
        example_ = json;
        return *this;
    }
    /// Of a region of nodes: a model file may give several, which are taken together.
    cls_Describe& InheritedMayBeSeveral(std::string_view name) {
        for (cls_Field& field : fields_) {
            if (name == field.name) field.mayBeSeveral = true;
        }
        return *this;
    }
    cls_Describe& NotInDeck(const char* why) {
        fields_.back().notInDeck = why;
        return *this;
    }
    cls_Describe& Verbatim() {
        fields_.back().verbatim = true;
        return *this;
    }
    cls_Describe& FreeText() {
        fields_.back().freeText = true;
        return *this;
    }
    /// `Items` takes the record as a const C&.
    template <auto Items>
    cls_Describe& DefaultItems() {
        fields_.back().defaultItems = [](const cls_Record& record) {
            return Items(static_cast<const C&>(record));
        };
        return *this;
    }
    cls_Describe& Required() {
        fields_.back().required = true;
        return *this;
    }
    cls_Describe& NotModelData() {
        fields_.back().notModelData = true;
        return *this;
    }
    cls_Describe& InBaseState(cls_BaseStateRule rule) {
        fields_.back().baseState = rule;
        return *this;
    }
};

/// Shows the fields of a record one by one; what DBWrite talks to.
class cls_WriteVisitor {
public:
    virtual ~cls_WriteVisitor() = default;
    virtual void Visit(const cls_Field& field, const cls_FieldType& type, const void* value) = 0;
};

/// Whether the value is the marker of a field without one.
bool cls_IsUnset(const cls_FieldType& type, const void* value);

#include "store_interface/records/cls_FieldTypes.inl"

#endif
