// Times and peak memory of whole tasks, each in a process of its own:
//     bench_model [TASK ...]
// Tasks: load, rss, instances, surface, materials, sections, conditions, contact; all of them without an
// argument. The exit code is 1 when a bound is missed; those of time may be on a machine that is busy.
#include "deck/oif_Writer.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactProperty.h"
#include "store_interface/records/sections/kseC_SolidSections.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"

#include <malloc.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cmath>
#include <cstdio>
#include <ctime>
#include <fstream>
#include <functional>
#include <numeric>
#include <random>

namespace {

struct Measure {
    double seconds = 0.0;
    double work = 0.0; ///< seconds of the processor, which other work on the machine doesn't count in
    double peakMiB = 0.0;
    double moreMiB = 0.0; ///< peak of the task, beyond what was in memory before
};

bool missed = false;

/// The value and its bound, as text.
std::string AtMost(double value, double bound, const char* format = "%.1f") {
    char text[64];
    std::snprintf(text, sizeof text, format, value);
    std::string shown = text;
    std::snprintf(text, sizeof text, format, bound);
    shown.append(" (at most ").append(text).append(value > bound ? ": MISSED)" : ")");
    missed = missed || value > bound;
    return shown;
}

double ResidentMiB() {
    std::ifstream file("/proc/self/statm");
    double total = 0.0;
    double resident = 0.0;
    file >> total >> resident;
    return resident * static_cast<double>(sysconf(_SC_PAGESIZE)) / 1048576.0;
}

/// Lets the peak of the process begin anew.
void ForgetPeak() {
    malloc_trim(0);
    std::ofstream("/proc/self/clear_refs") << "5";
}

/// Runs the task in a child; `prepare` there first, untimed.
Measure InChild(const std::function<std::function<void()>()>& prepare) {
    int pipe_[2];
    if (pipe(pipe_) != 0) std::exit(1);
    if (fork() == 0) {
        const std::function<void()> task = prepare();
        ForgetPeak();
        const double before = ResidentMiB();
        const auto start = std::chrono::steady_clock::now();
        const std::clock_t startOfWork = std::clock();
        task();
        Measure measure;
        measure.work = static_cast<double>(std::clock() - startOfWork) / CLOCKS_PER_SEC;
        measure.seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
        rusage usage{};
        getrusage(RUSAGE_SELF, &usage);
        measure.peakMiB = static_cast<double>(usage.ru_maxrss) / 1024.0;
        measure.moreMiB = measure.peakMiB - before;
        if (write(pipe_[1], &measure, sizeof measure) != sizeof measure) _exit(1);
        _exit(0);
    }
    Measure measure;
    const auto got = read(pipe_[0], &measure, sizeof measure);
    wait(nullptr);
    close(pipe_[0]);
    close(pipe_[1]);
    if (got != sizeof measure) std::exit(1);
    return measure;
}

using Preparation = std::function<std::function<void()>()>;

/// The quickest of five runs of each, which take turns: the machine may change its speed meanwhile.
std::vector<Measure> InTurns(const std::vector<Preparation>& tasks) {
    std::vector<Measure> best(tasks.size());
    for (int round = 0; round < 5; ++round) {
        for (std::size_t i = 0; i < tasks.size(); ++i) {
            const Measure next = InChild(tasks[i]);
            if (round == 0 || next.work < best[i].work) best[i] = next;
        }
    }
    return best;
}

/// How many times the work of the one the other takes.
std::string Growth(const Measure& from, const Measure& to, double bound, const char* format = "%.1f") {
    return AtMost(to.work / from.work, bound, format);
}

std::vector<float> Coordinates(int nodes) {
    std::mt19937 random(1);
    std::uniform_real_distribution<float> side(-500.0F, 500.0F);
    std::vector<float> xyz(3 * static_cast<std::size_t>(nodes));
    for (std::size_t i = 0; i < xyz.size(); ++i) xyz[i] = i % 30 == 29 ? 0.0F : side(random);
    return xyz;
}

std::vector<int> Labels(int count) {
    std::vector<int> labels(static_cast<std::size_t>(count));
    std::iota(labels.begin(), labels.end(), 1);
    return labels;
}

/// A part with nodes, and hexahedra on runs of eight of them.
void FillPart(odiK_Part& part, int nodes, int elements) {
    part.mesh.Reset(new odiK_Mesh());
    part.mesh->SetNodes(Labels(nodes), Coordinates(nodes));
    std::vector<int> corners;
    corners.reserve(8 * static_cast<std::size_t>(elements));
    for (int e = 0; e < elements; ++e) {
        for (int k = 0; k < 8; ++k) corners.push_back((e * 7 + k * 13) % nodes + 1);
    }
    part.mesh->AddElements("C3D8", Labels(elements), 8, std::move(corners));
}

std::shared_ptr<odb_Odb> MeshStore(int count) {
    auto odb = std::make_shared<odb_Odb>();
    odiK_Model& model = odb->AddModel(odb_Odb::DefaultModelName());
    FillPart(model.AddPart("P"), count, count);
    model.AddInstance("I", "P");
    model.Complete();
    return odb;
}

std::function<void()> WriteTask(const std::shared_ptr<odb_Odb>& odb) {
    return [odb] { oif_Writer(*odb).WriteInputFile("bench_model"); };
}

void MeasureLoad() {
    const char* const path = "bench_model.json";
    {
        std::ofstream out(path);
        mdf_WriteModelFile(*MeshStore(1000000), out);
    }
    std::ifstream in(path, std::ios::ate | std::ios::binary);
    const double megabytes = static_cast<double>(in.tellg()) / 1e6;
    const Measure load = InChild([&] {
        return [&] {
            mdf_Report report;
            if (mdf_ReadModelFile(path, report) == nullptr) std::exit(1);
        };
    });
    std::printf(
        "load: %.0f MB in %.2f s, %.0f MB/s (at least 40); peak %.0f MiB, %.2f times the file (at most 4)\n",
        megabytes, load.seconds, megabytes / load.seconds, load.peakMiB, load.peakMiB * 1.048576 / megabytes);
    std::remove(path);
}

Preparation WriteInstances(int instances) {
    return [instances] {
        auto odb = std::make_shared<odb_Odb>();
        odiK_Model& model = odb->AddModel(odb_Odb::DefaultModelName());
        odiK_Part& part = model.AddPart("P");
        FillPart(part, 100, 50);
        for (int s = 0; s < 200; ++s) {
            part.mesh->AddNodeSet(cow_String("SET-") + cow_String(s),
                                  {s % 100 + 1, (s * 7) % 100 + 1, (s * 3) % 100 + 1});
        }
        for (int i = 0; i < instances; ++i) model.AddInstance(cow_String("I-") + cow_String(i), "P");
        model.Complete();
        return WriteTask(odb);
    };
}

void MeasureInstances() {
    const auto times = InTurns({WriteInstances(100), WriteInstances(1000), WriteInstances(10000)});
    std::printf(
        "instances with 200 sets each: 100 in %.3f s, 1,000 in %.3f s, 10,000 in %.3f s; ratios %s and %s\n",
        times[0].work, times[1].work, times[2].work, Growth(times[0], times[1], 12).c_str(),
        Growth(times[1], times[2], 12).c_str());
}

void MeasureSurface() {
    constexpr int facets = 1000000;
    const auto withSet = [&](const std::function<void(odiK_Mesh&)>& add) {
        return InChild([&] {
            auto odb = std::make_shared<odb_Odb>();
            odiK_Model& model = odb->AddModel(odb_Odb::DefaultModelName());
            odiK_Part& part = model.AddPart("P");
            part.mesh.Reset(new odiK_Mesh());
            part.mesh->SetNodes({1, 2, 3, 4, 5, 6, 7, 8}, std::vector<float>(24));
            std::vector<int> corners;
            for (int e = 0; e < 2 * facets; ++e) corners.insert(corners.end(), {1, 2, 3, 4, 5, 6, 7, 8});
            // SURF keeps the elements themselves out of the deck.
            part.mesh->AddElements("C3D8SURF", Labels(2 * facets), 8, std::move(corners));
            add(*part.mesh);
            model.AddInstance("I", "P");
            model.Complete();
            return WriteTask(odb);
        });
    };
    std::mt19937 random(3);
    std::vector<int> labels;
    std::vector<odiK_FacetInput> faces;
    for (int i = 0; i < facets; ++i) {
        labels.push_back(2 * i + 1 + static_cast<int>(random() % 2));
        faces.push_back({labels.back(), static_cast<int>(random() % 6), {}});
    }
    const Measure set = withSet([&](odiK_Mesh& mesh) { mesh.AddElementSet("S", labels); });
    const Measure surface = withSet([&](odiK_Mesh& mesh) { mesh.AddSurface("S", faces); });
    std::printf("surface of 1,000,000 facets on six faces: %.3f s; irregular set of as many labels: %.3f s; "
                "ratio %s\n",
                surface.seconds, set.seconds, AtMost(surface.seconds / set.seconds, 4).c_str());
}

/// Ten options with a table each, of numbers as they come from measurements.
kmaC_Material MaterialOfTenOptions(int rows, std::mt19937& random) {
    std::uniform_real_distribution<double> mantissa(1.0, 10.0);
    std::uniform_int_distribution<int> exponent(-6, 5);
    const auto table = [&] {
        kmaC_MaterialTable values(rows, 3);
        for (int row = 0; row < rows; ++row) {
            values.Put(row, 0, mantissa(random) * std::pow(10.0, exponent(random)));
            values.Put(row, 1, std::round(mantissa(random) * 100.0) / 1000.0);
            values.Put(row, 2, 20.0 + row);
        }
        return values;
    };
    const auto option = [&](auto record) {
        record.temperatureDependency = true;
        record.table = table();
        return record;
    };
    kmaC_Material material;
    material.density = option(kmaC_Density());
    material.elastic = option(kmaC_Elastic());
    material.plastic = option(kmaC_Plastic());
    material.conductivity = option(kmaC_Conductivity());
    material.specificHeat = option(kmaC_SpecificHeat());
    material.expansion = option(kmaC_Expansion());
    material.electricalConductivity = option(kmaC_ElectricalConductivity());
    material.creep = option(kmaC_Creep());
    material.swelling = option(kmaC_Swelling());
    material.viscous = option(kmaC_Viscous());
    return material;
}

void MeasureMaterials() {
    double rate[2] = {};
    const std::pair<int, int> sizes[] = {{2000, 200}, {200, 2000}};
    for (int i = 0; i < 2; ++i) {
        const int materials = sizes[i].first;
        const int rows = sizes[i].second;
        const Measure write = InChild([&] {
            std::mt19937 random(9);
            auto odb = std::make_shared<odb_Odb>();
            odiK_Model& model = odb->AddModel(odb_Odb::DefaultModelName());
            for (int m = 0; m < materials; ++m) {
                model.materials.Insert(cow_String("M-") + cow_String(m), MaterialOfTenOptions(rows, random));
            }
            model.Complete();
            return WriteTask(odb);
        });
        std::ifstream deck("bench_model.inp", std::ios::ate | std::ios::binary);
        const double megabytes = static_cast<double>(deck.tellg()) / 1e6;
        rate[i] = megabytes / write.seconds;
        std::printf("%d materials of ten options with %d rows: %.0f MB in %.2f s, %.0f MB/s (at least 40)\n",
                    materials, rows, megabytes, write.seconds, rate[i]);
    }
    std::printf("rows ten times as many, in a tenth of the materials: %s times the time for a byte\n",
                AtMost(rate[0] / rate[1], 1.2, "%.2f").c_str());
}

/// A model that `instances` instances show, with a solid section on all elements of the part and a material
/// orientation on each of the sets.
std::shared_ptr<odb_Odb> SectionStore(int elements, int instances, int sets, bool withAttributes) {
    auto odb = std::make_shared<odb_Odb>();
    odiK_Model& model = odb->AddModel(odb_Odb::DefaultModelName());
    odiK_Part& part = model.AddPart("P");
    FillPart(part, std::max(elements / 10, 100), elements);
    // Neighbours in different sets, so that no set is regular.
    std::vector<std::vector<int>> members(static_cast<std::size_t>(std::max(sets, 1)));
    for (int e = 0; e < elements; ++e)
        members[static_cast<std::size_t>((e * 7 + e / std::max(sets, 1)) % std::max(sets, 1))].push_back(e +
                                                                                                         1);
    part.mesh->AddElementSet("ALL", Labels(elements));
    for (int s = 0; s < sets; ++s) {
        part.mesh->AddElementSet(cow_String("SET-") + cow_String(s), members[static_cast<std::size_t>(s)]);
    }
    if (withAttributes) {
        kseC_HomogenousSolidSection section;
        section.materialName = "Steel";
        model.sections.Insert("Solid", section);
        ptoC_SectionAssignment assignment;
        assignment.sectionName = "Solid";
        part.attributes.sectionAssignments.push_back({"ALL", mdl_ObjCow<ptoC_PartAttribute>(assignment)});
        for (int s = 0; s < sets; ++s) {
            part.attributes.materialOrientations.push_back(
                {cow_String("SET-") + cow_String(s),
                 mdl_ObjCow<ptoC_PartAttribute>(ptoC_MaterialOrientation())});
        }
    }
    for (int i = 0; i < instances; ++i) model.AddInstance(cow_String("I-") + cow_String(i), "P");
    model.Complete();
    return odb;
}

void MeasureRss() {
    const std::pair<const char*, std::function<std::shared_ptr<odb_Odb>(int)>> models[] = {
        {"no section", MeshStore},
        {"one section", [](int count) { return SectionStore(count, 1, 0, true); }},
        {"fifty groups", [](int count) { return SectionStore(count, 1, 50, true); }}};
    for (const auto& [name, make] : models) {
        for (const int count : {1000000, 4000000}) {
            const Measure write = InChild([&] { return WriteTask(make(count)); });
            std::printf("%d elements, %s: writing takes %s MiB more than the store; %.2f s\n", count, name,
                        AtMost(write.moreMiB, 16).c_str(), write.seconds);
        }
    }
}

void MeasureSections() {
    constexpr int elements = 1000000;
    const auto write = [&](bool withAttributes) {
        return InChild([&] { return WriteTask(SectionStore(elements, 1, 50, withAttributes)); });
    };
    const Measure without = write(false);
    const Measure with = write(true);
    const Measure loop = InChild([&]() -> std::function<void()> {
        return [] {
            std::FILE* file = std::fopen("bench_model.inp", "w");
            if (file == nullptr) std::exit(1);
            std::setvbuf(file, nullptr, _IOFBF, 256 * 1024);
            for (int e = 1; e <= elements; ++e) {
                const int n = e % 90000;
                std::fprintf(file, "%7d,%7d,%7d,%7d,%7d,%7d,%7d,%7d,%7d\n", e, n + 1, n + 14, n + 27, n + 40,
                             n + 53, n + 66, n + 79, n + 92);
            }
            std::fclose(file);
        };
    });
    const double seconds = with.seconds - without.seconds;
    std::printf(
        "sections of 1,000,000 elements in 50 groups: %.3f s; fprintf of their element block: %.3f s; "
        "ratio %s\n",
        seconds, loop.seconds, AtMost(seconds / loop.seconds, 0.8, "%.2f").c_str());

    const auto many = [](int instances) {
        return [instances] { return WriteTask(SectionStore(400, instances, 20, true)); };
    };
    const auto times = InTurns({many(100), many(1000)});
    std::printf("instances with 20 assignments each: 100 in %.3f s, 1,000 in %.3f s; ratio %s\n",
                times[0].work, times[1].work, Growth(times[0], times[1], 12).c_str());
}

cow_String Numbered(const char* prefix, int number) {
    return cow_String(prefix) + cow_String(number);
}

/// An instance of a part of `nodes` nodes and an eighth as many elements, and the steps S-0, initial, to
/// S-`steps`.
odiK_Model& ModelOfSteps(odb_Odb& odb, int nodes, int steps, const std::function<void(odiK_Mesh&)>& addSets) {
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    odiK_Part& part = model.AddPart("P");
    FillPart(part, nodes, nodes / 8);
    addSets(*part.mesh);
    model.AddInstance("I", "P");
    model.steps.Append("S-0", kprC_InitialStep());
    for (int s = 1; s <= steps; ++s) model.steps.Append(Numbered("S-", s), kprC_StaticStep());
    return model;
}

/// What goes on with the conditions in the steps.
enum class History {
    CHANGED,   ///< each step changes one condition in a hundred, the others are carried over
    REWRITTEN, ///< in each step one of them ends, so that all others are said again
    OTHER      ///< each step gives every condition another value
};

/// `conditions` displacement conditions and as many forces, each on a node set of its own.
std::shared_ptr<odb_Odb> ConditionStore(int conditions, int steps, History history) {
    auto odb = std::make_shared<odb_Odb>();
    odiK_Model& model = ModelOfSteps(*odb, conditions, steps, [&](odiK_Mesh& mesh) {
        for (int c = 0; c < conditions; ++c) mesh.AddNodeSet(Numbered("SET-", c), {c + 1});
    });
    for (int c = 0; c < conditions; ++c) {
        kbcC_DisplacementBC bc;
        kloC_ConcentratedForce force;
        bc.region = force.region = model.Region("I", Numbered("SET-", c));
        const auto set = [&](int step, double value) {
            mdl_StateEdit<kbcC_DisplacementBCState>(bc.Give(Numbered("S-", step)))
                .Set<&kbcC_DisplacementBCState::u1>(0.001 * value)
                .Set<&kbcC_DisplacementBCState::u3>(0.0);
            mdl_StateEdit<kloC_ConcentratedForceState>(force.Give(Numbered("S-", step)))
                .Set<&kloC_ConcentratedForceState::component2>(value);
        };
        set(1, c + 0.5);
        for (int step = 2; step <= steps; ++step) {
            if (history == History::CHANGED && (c + step) % 100 == 0) set(step, c + step);
            if (history == History::OTHER) set(step, c + step);
            if (history == History::REWRITTEN && c == step) {
                mdl_StateEdit<kbcC_DisplacementBCState>(bc.Give(Numbered("S-", step))).Deactivate();
                mdl_StateEdit<kloC_ConcentratedForceState>(force.Give(Numbered("S-", step))).Deactivate();
            }
        }
        model.boundaryConditions.Insert(Numbered("BC-", c), bc);
        model.loads.Insert(Numbered("LOAD-", c), force);
    }
    model.Complete();
    return odb;
}

void MeasureConditions() {
    const auto write = [](int conditions, int steps, History history) {
        return [=] { return WriteTask(ConditionStore(conditions, steps, history)); };
    };
    const auto changed = InTurns({write(10000, 5, History::CHANGED), write(10000, 100, History::CHANGED),
                                  write(1000, 100, History::CHANGED)});
    std::printf("10,000 boundary conditions and loads, a hundredth of them changed in each step: 5 steps in "
                "%.3f s, 100 in %.3f s, ratio %s; a tenth of them in %.3f s, ratio %s\n",
                changed[0].work, changed[1].work, Growth(changed[0], changed[1], 20).c_str(), changed[2].work,
                Growth(changed[2], changed[1], 12).c_str());

    const auto again = InTurns({write(10000, 5, History::REWRITTEN), write(10000, 100, History::REWRITTEN)});
    std::ifstream deck("bench_model.inp", std::ios::ate | std::ios::binary);
    constexpr double cards = 2.0 * 10000 * 99;
    std::printf(
        "all of them said again in each step: 5 steps in %.3f s, 100 in %.3f s, ratio %s, as many more "
        "are said; deck of %.0f MB; %s bytes of memory for each card\n",
        again[0].work, again[1].work, Growth(again[0], again[1], 24.75, "%.2f").c_str(),
        static_cast<double>(deck.tellg()) / 1e6,
        AtMost(again[1].moreMiB * 1048576.0 / cards, 80, "%.0f").c_str());
    const Measure other = InChild(write(1000, 100, History::OTHER));
    std::printf("a tenth of them, with another value in each step: %.3f s, %.0f bytes for each card\n",
                other.work, other.moreMiB * 1048576.0 / (cards / 10.0));
}

/// `pairs` contact pairs, each on two surfaces of its own. A tenth of them changes its friction in each step.
std::shared_ptr<odb_Odb> ContactStore(int pairs, int steps) {
    auto odb = std::make_shared<odb_Odb>();
    odiK_Model& model = ModelOfSteps(*odb, 16 * pairs, steps, [&](odiK_Mesh& mesh) {
        for (int p = 0; p < pairs; ++p) {
            mesh.AddSurface(Numbered("MASTER-", p), {{2 * p + 1, -1, "S1"}});
            mesh.AddSurface(Numbered("SLAVE-", p), {{2 * p + 2, -1, "S2"}});
        }
    });
    for (int i = 0; i < 2; ++i) {
        kinC_TangentialBehavior friction;
        friction.formulation = 1;
        friction.slipTolerance = 0.005;
        friction.table = cow_2DArray<double>(1, 1);
        friction.table.Put(0, 0, 0.1 * (i + 1));
        kinC_ContactProperty property;
        property.tangentialBehavior = friction;
        model.interactionProperties.Insert(Numbered("FRICTION-", i), property);
    }
    for (int p = 0; p < pairs; ++p) {
        kinC_SurfaceToSurfaceContactStd contact;
        contact.master = model.Region("I", Numbered("MASTER-", p));
        contact.slave = model.Region("I", Numbered("SLAVE-", p));
        for (int step = 1; step <= steps; ++step) {
            if (step > 1 && (p + step) % 10 != 0) continue;
            mdl_StateEdit<kinC_SurfaceToSurfaceContactStdState>(contact.Give(Numbered("S-", step)))
                .Set<&kinC_SurfaceToSurfaceContactStdState::InteractionProperty>(
                    Numbered("FRICTION-", step % 2));
        }
        model.interactions.Insert(Numbered("PAIR-", p), contact);
    }
    model.Complete();
    return odb;
}

void MeasureContact() {
    const auto write = [](int pairs, int steps) {
        return [=] { return WriteTask(ContactStore(pairs, steps)); };
    };
    const auto times = InTurns({write(5000, 20), write(500, 20), write(5000, 2), write(5000, 200)});
    std::printf(
        "5,000 contact pairs, a tenth of them changed in each step: 20 steps in %.3f s, peak %.0f MiB; "
        "a tenth of the pairs in %.3f s, ratio %s; 2 steps in %.3f s, ratio %.1f, 200 in %.3f s, ratio %s\n",
        times[0].work, times[0].peakMiB, times[1].work, Growth(times[1], times[0], 12).c_str(), times[2].work,
        times[0].work / times[2].work, times[3].work, Growth(times[0], times[3], 12).c_str());
}

} // namespace

int main(int argc, char** argv) {
    const std::pair<const char*, void (*)()> tasks[] = {{"load", MeasureLoad},
                                                        {"rss", MeasureRss},
                                                        {"instances", MeasureInstances},
                                                        {"surface", MeasureSurface},
                                                        {"materials", MeasureMaterials},
                                                        {"sections", MeasureSections},
                                                        {"conditions", MeasureConditions},
                                                        {"contact", MeasureContact}};
    for (const auto& [name, task] : tasks) {
        bool wanted = argc == 1;
        for (int i = 1; i < argc; ++i) wanted = wanted || std::string(argv[i]) == name;
        if (wanted) task();
    }
    std::remove("bench_model.inp");
    return missed ? 1 : 0;
}
