// The fields of a model's frame: what model files call them, and what they are.
#include "store_interface/model/odiK_Model.h"

const omu_EnumTable& omu_EnumTableOf(dtu_DatumType) {
    static constexpr omu_EnumRow rows[] = {
        {1, "point", "point"}, {2, "axis", "axis"}, {3, "plane", "plane"}, {4, "csys", "csys"}};
    static constexpr omu_EnumTable table{"dtu_DatumType", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(dtu_DatumCsysType) {
    static constexpr omu_EnumRow rows[] = {
        {1, "rectangular", "rectangular"}, {2, "cylindrical", "cylindrical"}, {3, "spherical", "spherical"}};
    static constexpr omu_EnumTable table{"dtu_DatumCsysType", rows};
    return table;
}

namespace {

constexpr const char* kWaveFormulations[] = {"NOT_SET", "SCATTERED", "TOTAL"};

constexpr cls_IntMeaning kAnalysisProducts[] = {
    {static_cast<int>(kprC_AnalysisProductEnm::IMPLICIT), "STANDARD"},
    {static_cast<int>(kprC_AnalysisProductEnm::IMPLICIT), "IMPLICIT"},
    {static_cast<int>(kprC_AnalysisProductEnm::EXPLICIT), "EXPLICIT"},
};

/// The members that parts have, and instances that differ from theirs.
template <class Owner, auto SolverInput, auto Mesh, auto Sections, auto Materials, auto Beams,
          cls_TreeEnm Attributes>
void DescribeOwner(cls_Describe<Owner>& fields) {
    fields.template Field<SolverInput>("solverInput", "deck text that closes the part or instance")
        .Verbatim()
        .template Tree<Mesh, cls_TreeEnm::Mesh>("mesh", "nodes, elements and sets")
        .template Tree<Sections, Attributes>("sectionAssignments",
                                             "which section its elements have; a later one wins")
        .template Of<ptoC_SectionAssignment>()
        .template Tree<Materials, Attributes>("materialOrientations", "orientations of its material")
        .template Of<ptoC_MaterialOrientation>()
        .template Tree<Beams, Attributes>("beamOrientations", "orientations of its beams")
        .template Of<ptoC_BeamOrientation>();
}

std::vector<odiK_AttributeInput>& SectionsOf(odiK_Part& part) {
    return part.attributes.sectionAssignments;
}
std::vector<odiK_AttributeInput>& MaterialOrientationsOf(odiK_Part& part) {
    return part.attributes.materialOrientations;
}
std::vector<odiK_AttributeInput>& BeamOrientationsOf(odiK_Part& part) {
    return part.attributes.beamOrientations;
}

constexpr char kNoConstants[] = "put the line of physical constants into topLevelSolverInput";
constexpr char kNoRestart[] = "the job's command line says what it goes on from";
constexpr char kNoGlobalJob[] = "the job's command line names the global job";

} // namespace

const cls_FieldTable& odiK_ModelData::Fields() {
    using R = odiK_ModelData;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::description>("description", "for people; never in the deck")
            .FreeText()
            .Field<&R::topLevelSolverInput>("topLevelSolverInput", "opening text of the deck")
            .Verbatim()
            .Field<&R::solverInput>("solverInput", "text that closes the model section")
            .Verbatim()
            .Field<&R::absoluteZero>("absoluteZero", "absolute zero on the temperature scale in use")
            .Unit("temperature")
            .NotInDeck(kNoConstants)
            .Field<&R::stefanBoltzmann>("stefanBoltzmann", "Stefan-Boltzmann constant")
            .Unit("power/(area*temperature^4)")
            .NotInDeck(kNoConstants)
            .Field<&R::waveFormulation>("waveFormulation", "how acoustic waves from outside are formulated")
            .Words(kWaveFormulations)
            .Field<&R::restartJob>("restartJob", "job that this one goes on from")
            .NotInDeck(kNoRestart)
            .Field<&R::restartStep>("restartStep", "step of that job to go on from")
            .NotInDeck(kNoRestart)
            .Field<&R::restartIncrement>("restartIncrement", "increment of that step to go on from")
            .NotInDeck(kNoRestart)
            .Field<&R::endRestartStep>("endRestartStep", "ends the step where the restart is read")
            .NotInDeck(kNoRestart)
            .Field<&R::globalJob>("globalJob", "job of the global model that drives this submodel")
            .NotInDeck(kNoGlobalJob)
            .Field<&R::shellToSolid>("shellToSolid", "the global model is of shells, the submodel of solids")
            .Field<&R::analysisProduct>(
                "analysisProduct", "without it EXPLICIT when an analysis step is explicit, else STANDARD")
            .Meanings(kAnalysisProducts)
            .Field<&R::cyclicSymmetry>("cyclicSymmetry", "the sector of a cyclic model")
            .Field<&R::ignore>("ignore", "warnings and notes that are known and not to be told, with reasons")
            .Tree<cls_TreeEnm::Datums>("datums", "coordinate systems, points, axes and planes")
            .Tree<cls_TreeEnm::Parts>("parts", "parts by name")
            .Tree<cls_TreeEnm::Assembly>("assembly", "the instances, and what spans them")
            .Example(
                R"({"description": "A plate under pressure", "materials": {"Steel": {"elastic": {"table": [[210000, 0.3]]}}}})");
    return fields;
}

const cls_FieldTable& odiK_IgnoredFinding::Fields() {
    using R = odiK_IgnoredFinding;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::code>("code", "the code that the finding is told with")
            .Required()
            .Field<&R::reason>("reason", "why it is meant to be so; for people")
            .FreeText()
            .Required()
            .Field<&R::place>("place", "JSON pointer, as the finding is told with: only there and below it; "
                                       "without it wherever it is found")
            .Example(R"({"code": "unused-nodes", "reason": "reference points of the customer's drawing"})");
    return fields;
}

const cls_FieldTable& odiK_Datum::Fields() {
    using R = odiK_Datum;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::name>("name", "the name of the datum")
            .NameOf("datum")
            .Required()
            .Field<&R::type>("type", "what kind of datum it is")
            .WordsOnly()
            .Field<&R::csysType>("system", "how a coordinate system measures")
            .WordsOnly()
            .Field<&R::origin>("origin", "point, or where the axes begin")
            .Field<&R::xAxis>("xAxis", "first axis, or the direction of an axis; any length")
            .Field<&R::yAxis>("yAxis", "second axis; any length")
            .Field<&R::zAxis>("zAxis",
                              "third axis, of a coordinate system the cross product of the other two "
                              "when left out, or the normal of a plane; any length")
            .Example(R"({"name": "Cylinder", "type": "csys", "system": "cylindrical", "origin": [0, 0, 0]})");
    return fields;
}

const cls_FieldTable& odiK_Part::Fields() {
    using R = odiK_Part;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .With(DescribeOwner<R, &R::solverInput, &R::mesh, SectionsOf, MaterialOrientationsOf,
                                BeamOrientationsOf, cls_TreeEnm::Attributes>)
            .Example(
                R"({"mesh": {"file": "plate.msh"}, "sectionAssignments": [{"region": "ALL", "sectionName": "Plate"}]})");
    return fields;
}

const cls_FieldTable& odiK_Instance::Fields() {
    using R = odiK_Instance;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::partName>("part", "the part that it shows")
            .NameOf("part")
            .Field<&R::isPartInstance>("partInstance", "false for an entry that is no part instance")
            .Field<&R::translation>("translation", "how it is moved; single precision")
            .Unit("length")
            .Field<&R::rotation>("rotation",
                                 "rotation vector through the origin: its direction is the axis, its length "
                                 "the angle in radians; applied before the translation")
            .With(DescribeOwner<R, &R::solverInput, &R::ownMesh, &R::ownSectionAssignments,
                                &R::ownMaterialOrientations, &R::ownBeamOrientations,
                                cls_TreeEnm::OwnAttributes>)
            .Example(R"({"part": "PART", "translation": [100, 0, 0]})");
    return fields;
}

const cls_FieldTable& odiK_Assembly::Fields() {
    using R = odiK_Assembly;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::name>("name", "name of the assembly")
            .NameOf("")
            .Field<&R::solverInput>("solverInput", "deck text that closes the assembly")
            .Verbatim()
            .Tree<cls_TreeEnm::Instances>("instances", "instances of parts by name")
            .Tree<cls_TreeEnm::AssemblyMesh>("mesh",
                                             "the assembly's own mesh; its elements may end in instances")
            .Tree<cls_TreeEnm::AssemblySets>("sets", "sets of members in instances and in its own mesh")
            .Tree<&R::sectionAssignments, cls_TreeEnm::AssemblyAttributes>(
                "sectionAssignments", "which section the elements of a region have; a later one wins")
            .Of<ptoC_SectionAssignment>()
            .Tree<&R::connectorOrientations, cls_TreeEnm::AssemblyAttributes>(
                "connectorOrientations", "orientations of connector elements")
            .Of<ptoC_ConnectorOrientation>()
            .Example(R"({"instances": {"PART-1": {"part": "PART"}}})");
    return fields;
}
