// Formatting throughput of the toolkit's formatter against KCoreAddons' KFormat, on the
// same inputs in the same process: relative date-times, file sizes and durations.
// Prints calls per second for each side and the ratio (above 1: the formatter is faster).

#include "text/declarativeformatter.h"

#include "../common/summary.h"

#include <KFormat>

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QTextStream>
#include <QTranslator>

#include <algorithm>
#include <functional>
#include <vector>

namespace {

// Runs body over every input for a fifth of a second; calls per second.
template <typename Input>
double callsPerSecond(const std::vector<Input> &inputs, const std::function<QString(const Input &)> &body)
{
    qint64 calls = 0;
    qint64 checksum = 0;
    QElapsedTimer timer;
    timer.start();
    do {
        for (const Input &input : inputs)
            checksum += body(input).size();
        calls += qint64(inputs.size());
    } while (timer.nsecsElapsed() < 200 * 1000 * 1000);
    const double seconds = timer.nsecsElapsed() / 1e9;
    if (checksum == 0)
        QTextStream(stderr) << "empty results\n";
    return calls / seconds;
}

void report(QTextStream &out, const char *name, double ours, double theirs);

double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

// Alternates rounds of the two sides so that both see the same machine; medians.
template <typename Input>
void compare(QTextStream &out, const char *name, const std::vector<Input> &inputs,
             const std::function<QString(const Input &)> &ours, const std::function<QString(const Input &)> &theirs)
{
    std::vector<double> a, b;
    for (int round = 0; round < 9; ++round) {
        a.push_back(callsPerSecond(inputs, ours));
        b.push_back(callsPerSecond(inputs, theirs));
    }
    report(out, name, median(a), median(b));
}

void report(QTextStream &out, const char *name, double ours, double theirs)
{
    out << QStringLiteral("  %1 %2 /s  KFormat %3 /s  ratio %4x\n")
               .arg(QString::fromLatin1(name), -24)
               .arg(ours, 10, 'f', 0)
               .arg(theirs, 10, 'f', 0)
               .arg(ours / theirs, 0, 'f', 2);
    Summary::row(QStringLiteral("formatter calls per second, %1, vs KFormat").arg(QLatin1String(name)),
                 Summary::count(ours, "/s"), Summary::count(theirs, "/s"), ours / theirs, Summary::AtLeast, 1.0);
}

} // namespace

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QTranslator catalogue;
    if (catalogue.load(QStringLiteral("quorvanepelkan-qt5_eng_en"), QStringLiteral(CATALOGUE_DIR)))
        QCoreApplication::installTranslator(&catalogue);

    DeclarativeFormatter formatter;
    KFormat format;

    // Moments from seconds to years away, both directions; sizes over every unit;
    // durations from seconds to days.
    const QDateTime now = QDateTime::currentDateTime();
    std::vector<QDateTime> moments;
    for (qint64 step : { 5LL, 90LL, 3600LL, 20000LL, 86400LL, 5 * 86400LL, 40 * 86400LL, 800 * 86400LL })
        for (int sign : { -1, 1 })
            moments.push_back(now.addSecs(sign * step));
    std::vector<qlonglong> sizes;
    for (qlonglong size = 7; size < (1LL << 42); size *= 13)
        sizes.push_back(size);
    std::vector<int> durations = { 5, 59, 61, 3599, 3700, 45000, 90000, 400000 };

    QTextStream out(stdout);
    out << "Formatter calls per second (median of 9 alternating rounds), same inputs, one process:\n";
    compare<QDateTime>(out, "relative (elapsed)", moments,
            [&](const QDateTime &d) { return formatter.formatDate(d, DeclarativeFormatter::DurationElapsed); },
            [&](const QDateTime &d) { return format.formatRelativeDateTime(d, QLocale::ShortFormat); });
    compare<QDateTime>(out, "relative (timepoint)", moments,
            [&](const QDateTime &d) { return formatter.formatDate(d, DeclarativeFormatter::TimepointRelative); },
            [&](const QDateTime &d) { return format.formatRelativeDateTime(d, QLocale::ShortFormat); });
    compare<qlonglong>(out, "file size", sizes,
            [&](const qlonglong &s) { return formatter.formatFileSize(s, 1); },
            [&](const qlonglong &s) { return format.formatByteSize(double(s), 1); });
    compare<int>(out, "duration", durations,
            [&](const int &s) { return formatter.formatDuration(s, DeclarativeFormatter::DurationLong); },
            [&](const int &s) { return format.formatDuration(quint64(s) * 1000); });
    return 0;
}
