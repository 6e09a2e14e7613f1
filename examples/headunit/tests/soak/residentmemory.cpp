#include "residentmemory.h"

#include <QFile>

#include <malloc.h>
#include <unistd.h>

#include <algorithm>

namespace {

// Fragments of the heap come and go; a leak of a word each event would pass this within 65 536.
constexpr qint64 fragments = 512 * 1024;
constexpr int fragmentsPercent = 2;

// What a steady growth may be: half a megabyte in ten million events.
constexpr double bytesPerEvent = 0.05;

// A short run cannot tell less than this from noise.
constexpr qint64 noise = 256 * 1024;

qint64 residentBytes()
{
    QFile file(QStringLiteral("/proc/self/statm"));
    if (!file.open(QIODevice::ReadOnly)) {
        return 0;
    }
    return file.readAll().split(' ').value(1).toLongLong() * sysconf(_SC_PAGESIZE);
}

qint64 allowance(qint64 resident)
{
    return std::max(fragments, resident * fragmentsPercent / 100);
}

} // namespace

MemorySample takeMemorySample(int events, double seconds)
{
    return {events, seconds, residentBytes(), static_cast<qint64>(mallinfo2().uordblks)};
}

QString growth(const QVector<MemorySample> &samples, int warmUp)
{
    const auto first = std::find_if(samples.cbegin(), samples.cend(), [warmUp](const auto &sample) {
        return sample.events >= warmUp;
    });
    if (first == samples.cend() || first->resident <= 0) {
        return QStringLiteral("nothing was measured after %1 events").arg(warmUp);
    }
    for (auto sample = first; sample != samples.cend(); ++sample) {
        if (sample->resident > first->resident + allowance(first->resident)) {
            return QStringLiteral(
                       "%1 KiB after %2 events, %3 KiB after %4; %5 KiB more are allowed")
                .arg(sample->resident / 1024)
                .arg(sample->events)
                .arg(first->resident / 1024)
                .arg(first->events)
                .arg(allowance(first->resident) / 1024);
        }
    }
    const MemorySample &last = samples.last();
    const auto middle = std::find_if(first, samples.cend(), [&last](const auto &sample) {
        return sample.events >= last.events / 2;
    });
    const qint64 grown = last.resident - middle->resident;
    const double allowed = (last.events - middle->events) * bytesPerEvent;
    if (grown > std::max<double>(allowed, noise)) {
        return QStringLiteral("%1 KiB more in the second half of the events").arg(grown / 1024);
    }
    return QString();
}
