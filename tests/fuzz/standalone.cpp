// Runs a fuzz target without libFuzzer (compilers other than clang): every file of the
// corpus folders first, then random changes of them until the time is up. The seed is
// fixed, so a run can be repeated. Takes libFuzzer's -max_total_time=N and -seed=N.
#include <QByteArray>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>

#include <cstdint>
#include <cstdio>
#include <random>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size);
extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv) __attribute__((weak));

int main(int argc, char **argv)
{
    if (LLVMFuzzerInitialize)
        LLVMFuzzerInitialize(&argc, &argv);
    int seconds = 20;
    unsigned seed = 1;
    std::vector<QByteArray> corpus;
    for (int i = 1; i < argc; ++i) {
        const QByteArray argument(argv[i]);
        if (argument.startsWith("-max_total_time="))
            seconds = argument.mid(16).toInt();
        else if (argument.startsWith("-seed="))
            seed = argument.mid(6).toUInt();
        else if (!argument.startsWith('-'))
            for (const QFileInfo &entry : QDir(QString::fromLocal8Bit(argument)).entryInfoList(QDir::Files)) {
                QFile file(entry.filePath());
                if (file.open(QIODevice::ReadOnly))
                    corpus.push_back(file.readAll());
            }
    }
    if (corpus.empty())
        corpus.push_back(QByteArray());
    for (const QByteArray &input : corpus)
        LLVMFuzzerTestOneInput(reinterpret_cast<const uint8_t *>(input.constData()), size_t(input.size()));

    std::mt19937 random(seed);
    QElapsedTimer timer;
    timer.start();
    long runs = 0;
    while (timer.elapsed() < seconds * 1000LL) {
        QByteArray input = corpus[random() % corpus.size()];
        for (int changes = 1 + random() % 8; changes > 0; --changes) {
            const int at = input.isEmpty() ? 0 : int(random() % input.size());
            switch (random() % 4) {
            case 0:
                if (!input.isEmpty())
                    input[at] = char(input[at] ^ (1 << (random() % 8)));
                break;
            case 1:
                input.insert(at, char(random()));
                break;
            case 2:
                input.remove(at, 1 + int(random() % 4));
                break;
            default:
                input.append(corpus[random() % corpus.size()].left(int(random() % 64)));
            }
        }
        LLVMFuzzerTestOneInput(reinterpret_cast<const uint8_t *>(input.constData()), size_t(input.size()));
        ++runs;
    }
    std::printf("Done %ld runs in %d second(s)\n", runs, seconds);
    return 0;
}
