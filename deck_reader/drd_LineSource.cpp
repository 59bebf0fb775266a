#include "deck_reader/drd_LineSource.h"

#include "foundation/thr_Progress.h"

#include <algorithm>

namespace {

constexpr std::size_t kBufferBytes = std::size_t{1} << 18;

} // namespace

drd_LineSource::drd_LineSource(std::FILE* file, thr_Progress* progress)
    : file_(file), progress_(progress), buffer_(kBufferBytes + 1) {
    // The buffer here is the only one.
    std::setvbuf(file, nullptr, _IONBF, 0);
    at_ = end_ = buffer_.data();
    Fill();
}

drd_LineSource::drd_LineSource(std::string_view text) : buffer_(text.size() + 1), atEnd_(true) {
    std::copy(text.begin(), text.end(), buffer_.begin());
    at_ = buffer_.data();
    end_ = at_ + text.size();
    Inspect(buffer_.data());
}

void drd_LineSource::Inspect(char* from) {
    auto bytes = static_cast<std::size_t>(end_ - from);
    if (const void* zero = std::memchr(from, '\0', bytes); zero != nullptr) {
        end_ = static_cast<const char*>(zero);
        bytes = static_cast<std::size_t>(end_ - from);
        isBinary_ = true;
        atEnd_ = true;
    }
    if (!hasBegun_) {
        hasBegun_ = true;
        if (std::string_view(at_, static_cast<std::size_t>(end_ - at_)).starts_with("\xEF\xBB\xBF")) at_ += 3;
    }
    const auto all = static_cast<std::size_t>(end_ - at_);
    isSimple_ = std::memchr(at_, '\r', all) == nullptr;
    hasTabs_ = std::memchr(at_, '\t', all) != nullptr;
}

void drd_LineSource::Fill() {
    const auto kept = static_cast<std::size_t>(end_ - at_);
    std::memmove(buffer_.data(), at_, kept);
    if (2 * kept > buffer_.size()) buffer_.resize(2 * buffer_.size());
    const std::size_t room = buffer_.size() - 1 - kept;
    const std::size_t got = std::fread(buffer_.data() + kept, 1, room, file_.get());
    if (progress_ != nullptr) progress_->Add(static_cast<long long>(got));
    if (got < room) {
        hasFailed_ = std::ferror(file_.get()) != 0;
        atEnd_ = true;
    }
    at_ = buffer_.data();
    end_ = at_ + kept + got;
    buffer_[kept + got] = '\0';
    Inspect(buffer_.data() + kept);
}

const char* drd_LineSource::LineEnd() const {
    const auto rest = static_cast<std::size_t>(end_ - at_);
    const auto* newline = static_cast<const char*>(std::memchr(at_, '\n', rest));
    if (isSimple_) return newline;
    const auto upTo = newline == nullptr ? rest : static_cast<std::size_t>(newline - at_);
    const auto* carriage = static_cast<const char*>(std::memchr(at_, '\r', upTo));
    return carriage != nullptr ? carriage : newline;
}

void drd_LineSource::StepOver(const char* ending) {
    at_ = ending + 1;
    if (*ending != '\r') return;
    if (at_ != end_ && *at_ == '\n') {
        ++at_;
    } else {
        hasLoneReturns_ = true;
    }
}

bool drd_LineSource::NextSlowly(std::string_view& line) {
    for (;;) {
        const char* ending = LineEnd();
        // Whether a carriage return stands alone shows the byte behind it.
        const bool isDecided = ending != nullptr && (*ending == '\n' || ending + 1 != end_ || atEnd_);
        if (isDecided || atEnd_) {
            if (ending == nullptr && at_ == end_) return false;
            const char* begin = at_;
            const char* stop = ending != nullptr ? ending : end_;
            if (static_cast<std::size_t>(stop - begin) > kLongestLine) return CutLine(line);
            line = {begin, static_cast<std::size_t>(stop - begin)};
            if (ending != nullptr) {
                StepOver(ending);
            } else {
                at_ = end_;
            }
            ++line_;
            return true;
        }
        if (static_cast<std::size_t>(end_ - at_) > kLongestLine) return CutLine(line);
        Fill();
    }
}

bool drd_LineSource::CutLine(std::string_view& line) {
    cut_.assign(at_, kLongestLine);
    wasCut_ = true;
    ++line_;
    line = cut_;
    for (;;) {
        const char* ending = LineEnd();
        if (ending != nullptr && (*ending == '\n' || ending + 1 != end_ || atEnd_)) {
            StepOver(ending);
            return true;
        }
        at_ = ending != nullptr ? ending : end_;
        if (atEnd_) return true;
        Fill();
    }
}
