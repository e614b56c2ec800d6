#pragma once

#include <QByteArray>
#include <QFile>
#include <QString>
#include <QTextStream>

// One row of the table scripts/run-benchmarks prints after all benchmarks: what is
// compared, our figure, the peer's, the ratio ours / peer and the goal for that ratio.
// Rows go to the file named by PELKAN_BENCH_SUMMARY (appended, one tab-separated line
// each); a benchmark run by hand prints them after its own output instead.
namespace Summary {

enum Direction { AtMost, AtLeast };

// ours and peer are the figures as printed (with their unit); ratio is ours / peer.
// Without a goal (goal <= 0) the row is for information and says so.
inline void row(const QString &benchmark, const QString &ours, const QString &peer, double ratio,
                Direction direction = AtMost, double goal = 1.0)
{
    const bool hasGoal = goal > 0;
    const bool met = direction == AtMost ? ratio <= goal : ratio >= goal;
    const QString line = QStringList { benchmark, ours, peer, QString::number(ratio, 'f', 2) + QLatin1Char('x'),
                                       hasGoal ? QString::fromUtf8(direction == AtMost ? "<= " : ">= ")
                                                       + QString::number(goal, 'f', 2) + QLatin1Char('x')
                                               : QStringLiteral("-"),
                                       hasGoal ? (met ? QStringLiteral("met") : QStringLiteral("MISSED"))
                                               : QStringLiteral("info") }
                                 .join(QLatin1Char('\t'));
    const QByteArray target = qgetenv("PELKAN_BENCH_SUMMARY");
    if (target.isEmpty()) {
        QTextStream(stdout) << "summary: " << line << Qt::endl;
        return;
    }
    QFile file(QString::fromLocal8Bit(target));
    if (file.open(QIODevice::Append | QIODevice::Text))
        QTextStream(&file) << line << '\n';
}

inline QString ms(double value) { return QString::number(value, 'f', 2) + QStringLiteral(" ms"); }
inline QString us(double value) { return QString::number(value, 'f', 2) + QStringLiteral(" us"); }
inline QString mb(double value) { return QString::number(value, 'f', 1) + QStringLiteral(" MB"); }
inline QString count(double value, const char *unit) { return QString::number(value, 'f', 0) + QLatin1Char(' ') + QLatin1String(unit); }

} // namespace Summary
