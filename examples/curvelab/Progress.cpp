#include "Progress.h"

#include <ostream>
#include <utility>

namespace curvelab {

namespace {

constexpr double patience = 1.0;
constexpr double rewriteInterval = 0.1;
constexpr double lineInterval = 5.0;

} // namespace

Progress::Progress(std::ostream& out, bool isTerminal, std::function<double()> seconds)
    : out_(out), isTerminal_(isTerminal), seconds_(std::move(seconds)), due_(seconds_() + patience)
{}

Progress::~Progress()
{
    if (said_ && isTerminal_)
        out_ << '\n' << std::flush;
}

void Progress::Begin(const std::string& task, std::size_t total)
{
    task_ = task;
    done_ = 0;
    total_ = total;
}

void Progress::Step()
{
    ++done_;
    const double now = seconds_();
    if (now <= due_)
        return;
    due_ = now + (isTerminal_ ? rewriteInterval : lineInterval);
    Say();
}

void Progress::Say()
{
    said_ = true;
    out_ << (isTerminal_ ? "\r" : "") << "curvelab: " << task_ << ", " << done_ << " of " << total_ << " curves"
         << (isTerminal_ ? "" : "\n") << std::flush;
}

} // namespace curvelab
