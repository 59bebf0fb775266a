#include "study/sty_Study.h"

#include "foundation/nex_Exception.h"
#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/model/odiK_IgnoreList.h"
#include "study/sty_Identity.h"
#include "study/sty_MeshSums.h"
#include "study/sty_Variants.h"

#include <algorithm>
#include <atomic>
#include <chrono>
#include <condition_variable>
#include <filesystem>
#include <thread>

namespace {

using Clock = std::chrono::steady_clock;

double SecondsSince(Clock::time_point start) {
    return std::chrono::duration<double>(Clock::now() - start).count();
}

/// What can't be used, and why.
class Unusable : public std::exception {
public:
    Unusable(std::string file, std::string text, bool refused = false)
        : file_(std::move(file)), text_(std::move(text)), refused_(refused) {}
    const char* what() const noexcept override { return text_.c_str(); }
    const std::string& File() const { return file_; }
    bool IsRefused() const { return refused_; }

private:
    std::string file_;
    std::string text_;
    bool refused_;
};

/// The rows that are left, in order, for several threads. A thread takes neighbours, of one folder: two that
/// make files in one folder wait for each other. Towards the end it takes fewer, so that all end together.
class RowQueue {
public:
    RowQueue(const sty_Table& table, sty_Rows rows, const sty_DoneRows& done, long long left, int threads)
        : reader_(table), rows_(rows), done_(done), left_(left), threads_(threads) {}

    /// The next rows in the place of these; none when there are no more.
    void Next(std::vector<sty_RawRow>& taken) {
        const std::lock_guard<std::mutex> lock(mutex_);
        const auto most = static_cast<std::size_t>(std::max(left_ / (4LL * threads_), 1LL));
        std::size_t count = 0;
        for (std::size_t bytes = 0; count < most && bytes < kMostBytes;) {
            if (count == taken.size()) taken.emplace_back();
            sty_RawRow& raw = taken[count];
            if (!reader_.Next(raw) || raw.number > rows_.last) break;
            if (raw.number < rows_.first || done_.Has(raw.number)) continue;
            ++count;
            bytes += raw.text.size();
            if (raw.number % sty_Layout::kMostEntries == 0) break;
        }
        taken.resize(count);
        left_ -= static_cast<long long>(count);
    }

private:
    static constexpr std::size_t kMostBytes = std::size_t{1} << 20;

    std::mutex mutex_;
    sty_TableReader reader_;
    sty_Rows rows_;
    const sty_DoneRows& done_;
    long long left_;
    int threads_;
};

/// One run of a study.
class Run {
public:
    Run(const sty_Request& request, sty_Observer& observer)
        : request_(request), observer_(observer), rowMeshes_(request.model) {}

    sty_Outcome Do() {
        const Clock::time_point start = Clock::now();
        ReadInputs();
        PrepareFolder();
        std::unique_ptr<sty_Variants> first = std::make_unique<sty_Variants>(std::move(template_), meshes_);
        TellBaseline(*first);
        RunRows(std::move(first), start);
        outcome_.counts.seconds = SecondsSince(start);
        return std::move(outcome_);
    }

private:
    void ReadInputs() {
        try {
            CheckTableIsNoLedger();
            table_ = std::make_unique<sty_Table>(request_.table);
        } catch (const sty_TableError& error) {
            throw Unusable(request_.table, error.what(), error.IsUnreadable());
        }
        mdf_Report report;
        const auto places = [&](const std::vector<mdf_Parameter>& parameters) {
            columns_ = std::make_unique<sty_Columns>(table_->Columns(), table_->HasHeader(), parameters);
            return columns_->Pointers();
        };
        identity_.templateSha256 = sty_Sha256OfFile(request_.model);
        template_ = mdf_Template::OfFile(request_.model, places, report, {request_.modelName});
        baseline_ = report.findings;
        if (template_ != nullptr) ignored_ = odiK_IgnoreList(template_->Store());
        Tell(report.findings);
        if (template_ == nullptr) {
            throw Unusable(request_.model,
                           report.unreadable ? "the template can't be read" : "the template is wrong",
                           report.unreadable);
        }
        if (!columns_->Problem().empty()) throw Unusable(request_.table, columns_->Problem());
        for (const std::string& pointer : columns_->Pointers()) {
            const auto problem = template_->ProblemOf(pointer);
            if (table_->HasHeader() && problem)
                observer_.Warn("all rows will fail: " + problem->found + ", expected " + problem->expected +
                               (problem->hint.empty() ? "" : "; " + problem->hint));
        }
        identity_.templatePath = request_.model;
        identity_.model = std::string(template_->Store().DeckModelName().View());
        identity_.tablePath = request_.table;
        identity_.tableSha256 = table_->Sha256();
        identity_.rows = table_->Rows();
        for (const mdf_MeshOrigin& origin : report.meshOrigins)
            identity_.meshes.emplace_back(origin.path, sty_Sha256OfFile(origin.path));
        layout_ = sty_Layout(table_->Rows());
        done_ = std::make_unique<sty_DoneRows>(table_->Rows());
        rows_ = sty_RowsOf(table_->Rows(), request_.shard, request_.shards);
        outcome_.counts.rows = rows_.last - rows_.first + 1;
    }

    void CheckTableIsNoLedger() const {
        const std::filesystem::path table = plt_Path(request_.table);
        bool isLedger = false;
        if (sty_Ledger::IsLedger(table.filename().string())) {
            sty_ForEachLine(request_.table, [&](std::string_view line, long long begin) {
                if (begin == 0) isLedger = sty_EntryOf(line).has_value();
            });
        }
        if (isLedger) throw sty_TableError("found the ledger of a study, expected a table of parameters");
    }

    void PrepareFolder() {
        if (request_.dryRun) return;
        folder_ = std::make_unique<sty_Folder>(request_.out);
        std::optional<std::string> held = folder_->Read(sty_Folder::kIdentity);
        // Another shard may have put it there meanwhile, ahead of all else that it writes.
        if (!held && !folder_->IsEmpty()) held = folder_->Read(sty_Folder::kIdentity);
        if (!held && !folder_->IsEmpty())
            throw Unusable(request_.out,
                           "found a folder with other files, expected a new or empty one, or a study's");
        folder_->Prepare();
        const auto writeIdentity = [this](int file) { return whf_WriteAll(file, identity_.Text()); };
        // Of several shards that begin at once one is the first.
        if (!held && !folder_->Write(sty_Folder::kIdentity, writeIdentity, false))
            held = folder_->Read(sty_Folder::kIdentity);
        if (held) CheckIdentity(*held);

        ledger_ = std::make_unique<sty_Ledger>(*folder_, sty_Ledger::NameOf(request_.shard, request_.shards));
        lock_ = folder_->Lock(PlacerName() + "lock");
        if (!lock_) throw Unusable(request_.out, "another run is at work on " + NameOfShard());
        if (ledger_->Exists() && !request_.resume)
            throw Unusable(request_.out, NameOfShard() + " was begun already: --resume goes on with it");
        if (ledger_->Exists()) RemoveUnplaced();
        ledger_->TakeUp(*done_, [this](const sty_Entry& entry) { CheckMeshes(entry); });
        TakeUpOthers();
        for (long long row = rows_.first; row <= rows_.last; ++row)
            outcome_.counts.earlier += done_->Has(row);
        ledger_->Open();
    }

    /// What the names of this shard's hidden files begin with.
    std::string PlacerName() const {
        return std::to_string(request_.shard) + "-of-" + std::to_string(request_.shards) + ".";
    }

    /// What a run that was killed was about to put in its place.
    void RemoveUnplaced() const {
        const auto folderOf = [&](long long row) {
            return plt_Path(layout_.PathOf(row, {})).parent_path().string();
        };
        for (long long row = rows_.first; row <= rows_.last; row += sty_Layout::kMostEntries)
            folder_->RemoveUnplaced(folderOf(row), PlacerName());
        if (rows_.last >= rows_.first) folder_->RemoveUnplaced(folderOf(rows_.last), PlacerName());
    }

    std::string NameOfShard() const {
        return request_.shards > 1
                   ? "shard " + std::to_string(request_.shard) + "/" + std::to_string(request_.shards)
                   : std::string("the study");
    }

    void CheckIdentity(const std::string& text) const {
        const std::optional<sty_Identity> held = sty_Identity::Of(text);
        const std::string place = request_.out + "/" + sty_Folder::kIdentity;
        if (!held) throw Unusable(place, "found a file that tells of no study");
        const std::string difference = identity_.DifferenceFrom(*held);
        if (difference.empty()) return;
        throw Unusable(request_.out, AnotherStudy(difference));
    }

    /// Rows that are done must not have got their decks from other meshes than those that are there now.
    void CheckMeshes(const sty_Entry& entry) {
        const std::string problem = rowMeshes_.ProblemOf(entry);
        if (!problem.empty()) throw Unusable(request_.out, AnotherStudy(problem));
    }

    static std::string AnotherStudy(const std::string& difference) {
        return "found another study: " + difference + "; give it a folder of its own, or remove this one";
    }

    /// Rows that were done under another division into shards. Shards of this one have rows of their own.
    void TakeUpOthers() {
        const std::string own = sty_Ledger::NameOf(request_.shard, request_.shards);
        const std::string sameDivision =
            own.substr(own.find("-of-") == std::string::npos ? 0 : own.find("-of-"));
        std::error_code error;
        for (const auto& entry : std::filesystem::directory_iterator(plt_Path(request_.out), error)) {
            const std::string name = entry.path().filename().string();
            if (!sty_Ledger::IsLedger(name) || name.ends_with(sameDivision)) continue;
            sty_ForEachLine(entry.path().string(), [&](std::string_view line, long long) {
                const std::optional<sty_Entry> found = sty_EntryOf(line);
                if (!found || found->deck.empty() || !done_->IsRow(found->row) || done_->Has(found->row))
                    return;
                if (folder_->SizeOf(std::string(found->deck)) != found->bytes) return;
                CheckMeshes(*found);
                done_->Add(found->row);
            });
        }
    }

    void Tell(std::vector<fnd_Finding> findings) {
        ignored_.TakeFrom(findings);
        for (const fnd_Finding& finding : findings) observer_.Tell(request_.model, finding);
    }

    void TellBaseline(sty_Variants& variants) {
        try {
            const std::vector<fnd_Finding> findings = variants.Baseline();
            baseline_.insert(baseline_.end(), findings.begin(), findings.end());
            Tell(findings);
        } catch (const QRXBasException&) {
            // Rows may mend what can't be written; those that don't will tell.
        }
        variants.LeaveOut(baseline_);
    }

    void RunRows(std::unique_ptr<sty_Variants> first, Clock::time_point start) {
        const long long left = outcome_.counts.rows - outcome_.counts.earlier;
        const int wanted =
            request_.jobs > 0 ? request_.jobs : static_cast<int>(std::thread::hardware_concurrency());
        const int jobs = static_cast<int>(std::clamp<long long>(wanted, 1, std::max(left, 1LL)));
        RowQueue queue(*table_, rows_, *done_, left, jobs);
        std::vector<std::unique_ptr<sty_Variants>> variants;
        variants.push_back(std::move(first));
        for (int job = 1; job < jobs; ++job) {
            variants.push_back(variants.front()->Twin());
            variants.back()->LeaveOut(baseline_);
        }
        std::vector<std::thread> threads;
        threads.reserve(static_cast<std::size_t>(jobs));
        running_ = jobs;
        for (int job = 0; job < jobs; ++job) {
            threads.emplace_back([&, job] {
                Work(queue, *variants[static_cast<std::size_t>(job)], job);
                const std::lock_guard<std::mutex> lock(mutex_);
                --running_;
                changed_.notify_all();
            });
        }
        Watch(start);
        for (std::thread& thread : threads) thread.join();
        if (failure_) std::rethrow_exception(failure_);
    }

    /// Until all threads have ended.
    void Watch(Clock::time_point start) {
        std::unique_lock<std::mutex> lock(mutex_);
        while (running_ > 0) {
            changed_.wait_for(lock, std::chrono::milliseconds(100), [&] { return running_ == 0; });
            sty_Counts counts = outcome_.counts;
            counts.seconds = SecondsSince(start);
            lock.unlock();
            const bool pause = observer_.Pause(counts);
            lock.lock();
            if (!pause || stop_) continue;
            stop_ = true;
            outcome_.kind = sty_Outcome::Kind::INTERRUPTED;
        }
    }

    void Work(RowQueue& queue, sty_Variants& variants, int job) {
        try {
            std::unique_ptr<sty_Placer> placer;
            if (folder_ != nullptr) {
                placer = std::make_unique<sty_Placer>(*folder_, PlacerName() + std::to_string(job));
            }
            std::vector<sty_RawRow> rows;
            for (queue.Next(rows); !rows.empty() && !stop_; queue.Next(rows)) {
                for (const sty_RawRow& raw : rows) {
                    if (!stop_) DoRow(raw, variants, placer.get());
                }
            }
        } catch (const sty_TableError& error) {
            Fail(std::make_exception_ptr(Unusable(request_.table, error.what(), true)));
        } catch (...) {
            Fail(std::current_exception());
        }
    }

    void DoRow(const sty_RawRow& raw, sty_Variants& variants, sty_Placer* placer) {
        const Clock::time_point start = Clock::now();
        sty_Result result = variants.Make(table_->Parse(raw), *columns_);
        if (result.IsDone() && ledger_ != nullptr) SumUpMeshes(result);
        if (result.IsDone()) Write(variants.Text(), placer, result);
        result.seconds = SecondsSince(start);
        if (ledger_ != nullptr) ledger_->Append(sty_LineOf(result));
        Count(result);
    }

    void SumUpMeshes(sty_Result& result) {
        for (auto& [file, sum] : result.meshes) {
            std::string problem;
            sum = rowMeshes_.Use(file, result.row, problem);
            if (!problem.empty()) result.errors.push_back({{}, {}, std::move(problem)});
        }
    }

    void Write(sty_DeckText& text, sty_Placer* placer, sty_Result& result) {
        result.deck = layout_.PathOf(result.row, result.name);
        result.sha256 = text.Sha256();
        if (placer == nullptr) return;
        const auto isSame = [&](const std::string& path) {
            // A run that was killed between the deck and its line in the ledger left it.
            return folder_->SizeOf(result.deck) == result.bytes && sty_Sha256OfFile(path) == result.sha256;
        };
        const auto write = [&](int file) { return text.WriteTo(file); };
        if (placer->Place(result.deck, write, false, isSame) == sty_Placer::Result::PLACED) return;
        // A failure of power may leave an empty file, of which nothing can be lost.
        if (folder_->SizeOf(result.deck) == 0) {
            placer->Place(result.deck, write, true, isSame);
            return;
        }
        result.errors.push_back({{},
                                 {},
                                 "found a file " + fnd_Quoted(result.deck) +
                                     " that isn't the row's deck, expected none; it has to be moved away"});
    }

    void Count(const sty_Result& result) {
        const std::lock_guard<std::mutex> lock(mutex_);
        if (result.IsDone()) {
            ++outcome_.counts.done;
            outcome_.counts.bytes += result.bytes;
            return;
        }
        ++outcome_.counts.failed;
        // The first ones by row, whenever they come.
        std::vector<sty_Failure>& failures = outcome_.failures;
        const bool isFull = failures.size() >= sty_Outcome::kMostFailures;
        if (isFull && failures.back().row < result.row) return;
        if (isFull) failures.pop_back();
        const auto place = std::ranges::upper_bound(failures, result.row, {}, &sty_Failure::row);
        failures.insert(place, {result.row, result.name, result.Reason()});
    }

    void Fail(std::exception_ptr failure) {
        const std::lock_guard<std::mutex> lock(mutex_);
        if (!failure_) failure_ = std::move(failure);
        stop_ = true;
    }

    const sty_Request& request_;
    sty_Observer& observer_;
    sty_Outcome outcome_;
    sty_Identity identity_;
    std::unique_ptr<sty_Table> table_;
    std::unique_ptr<sty_Columns> columns_;
    std::unique_ptr<mdf_Template> template_;
    std::vector<fnd_Finding> baseline_;
    odiK_IgnoreList ignored_;
    sty_MeshTexts meshes_;
    sty_MeshSums rowMeshes_;
    sty_Layout layout_;
    sty_Rows rows_;
    std::unique_ptr<sty_DoneRows> done_;
    std::unique_ptr<sty_Folder> folder_;
    std::unique_ptr<sty_Ledger> ledger_;
    std::optional<sty_Descriptor> lock_;

    std::mutex mutex_;
    std::condition_variable changed_;
    int running_ = 0;
    std::atomic<bool> stop_ = false;
    std::exception_ptr failure_;

public:
    /// As far as it came, for a run that was refused in its middle.
    sty_Outcome Outcome(sty_Outcome::Kind kind, std::string file, std::string problem) {
        outcome_.kind = kind;
        outcome_.file = std::move(file);
        outcome_.problem = std::move(problem);
        return std::move(outcome_);
    }
};

} // namespace

sty_Rows sty_RowsOf(long long rows, int shard, int shards) {
    // Without an overflow, also for many rows in many shards.
    const auto before = [&](long long count) {
        return rows / shards * count + rows % shards * count / shards;
    };
    return {before(shard - 1) + 1, before(shard)};
}

sty_Outcome sty_Run(const sty_Request& request, sty_Observer& observer) {
    Run run(request, observer);
    try {
        return run.Do();
    } catch (const Unusable& failure) {
        return run.Outcome(failure.IsRefused() ? sty_Outcome::Kind::REFUSED : sty_Outcome::Kind::WRONG,
                           failure.File(), failure.what());
    } catch (const sty_Refused& failure) {
        return run.Outcome(sty_Outcome::Kind::REFUSED, request.out, failure.what());
    }
}
