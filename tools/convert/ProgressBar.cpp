#include "tools/convert/ProgressBar.h"

#include <cstdio>

#include <unistd.h>

namespace DrawmereConvert {
namespace {

constexpr int barWidth = 30;
constexpr std::chrono::milliseconds pause(100);
constexpr const char* eraseLine = "\r\033[K";

/// Returns: at least three digits of a rate, or its whole part when that has more.
std::string describeRate(double rate) {
    char text[32];
    std::snprintf(text, sizeof text, rate < 10 ? "%.1f" : "%.0f", rate);
    return text;
}

std::string describeTime(double seconds) {
    const auto whole = static_cast<long>(seconds + 0.5);
    char text[32];
    if (whole < 3600) {
        std::snprintf(text, sizeof text, "%ld:%02ld", whole / 60, whole % 60);
    } else {
        std::snprintf(text, sizeof text, "%ld:%02ld:%02ld", whole / 3600, whole / 60 % 60,
                      whole % 60);
    }
    return text;
}

} // namespace

ProgressBar::ProgressBar(const std::string& barLabel, int pageCount, bool isWanted)
    : label(barLabel), total(pageCount), isShown(isWanted && isatty(STDERR_FILENO) != 0) {}

ProgressBar::~ProgressBar() { clear(); }

void ProgressBar::advance() {
    ++done;
    const Clock::time_point now = Clock::now();
    if (!isShown || now < next) {
        return;
    }
    next = now + pause;
    isVisible = true;
    const double seconds = std::chrono::duration<double>(now - begin).count();
    std::fprintf(stderr, "%s%s", eraseLine, describe(label, done, total, seconds).c_str());
    std::fflush(stderr);
}

void ProgressBar::clear() {
    if (isVisible) {
        std::fputs(eraseLine, stderr);
        std::fflush(stderr);
        isVisible = false;
    }
}

std::string ProgressBar::describe(const std::string& label, int done, int total, double seconds) {
    const int filled = total > 0 ? static_cast<int>(1.0 * barWidth * done / total) : barWidth;
    std::string text = label + " [" + std::string(filled, '#') +
                       std::string(barWidth - filled, '.') + "] " + std::to_string(done) + "/" +
                       std::to_string(total);
    if (done > 0 && seconds > 0) {
        text += "  " + describeRate(done / seconds) + " pages/s  " +
                describeTime(seconds / done * (total - done)) + " left";
    }
    return text;
}

} // namespace DrawmereConvert
