// SPDX-License-Identifier: MIT
// What loading the library costs beside a Qt library of about 300 KB, Qt5Svg. Each load is measured in a fresh
// process that has Qt Widgets loaded already, with all symbols bound at once. The figure that counts is the ratio.
#include <benchmark/benchmark.h>

#include <QtCore/QByteArray>
#include <QtCore/QElapsedTimer>
#include <QtCore/QFile>
#include <QtCore/QFileInfo>
#include <QtCore/QLibraryInfo>
#include <QtCore/QProcess>
#include <QtCore/QTemporaryDir>
#include <QtWidgets/QApplication>

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <dlfcn.h>
#include <vector>

namespace
{
constexpr int LoadCount = 41;
const char LoadOption[] = "--load";

// In the child: loads the file and prints the nanoseconds.
int load(const char* file)
{
    if (dlopen(file, RTLD_NOLOAD | RTLD_LAZY) != nullptr) {
        std::fprintf(stderr, "%s was loaded before\n", file);
        return 1;
    }
    QElapsedTimer elapsed;
    elapsed.start();
    void* handle = dlopen(file, RTLD_NOW | RTLD_LOCAL);
    const qint64 nanoseconds = elapsed.nsecsElapsed();
    if (handle == nullptr) {
        std::fprintf(stderr, "%s\n", dlerror());
        return 1;
    }
    std::printf("%lld\n", static_cast<long long>(nanoseconds));
    return 0;
}

QString fileOf(const void* symbol)
{
    Dl_info info;
    if (dladdr(symbol, &info) == 0) {
        return QString();
    }
    return QFileInfo(QFile::decodeName(info.dli_fname)).canonicalFilePath();
}

// Like every benchmark this one is linked to the library, and would have it loaded before it can measure. In front
// of it on the search path the children find, under its name, Qt Widgets, which they have anyway.
class Children
{
public:
    Children()
    {
        const QString widgets = fileOf(reinterpret_cast<const void*>(&QApplication::staticMetaObject));
        const QString name = QFileInfo(QFile::decodeName(ZELKOV_WIDGETS_FILE)).fileName();
        // libX.so.1.2.3 is needed as libX.so.1.
        const int major = name.indexOf(QLatin1Char('.'), name.indexOf(QLatin1String(".so.")) + 4);
        QFile::link(widgets, m_folder.filePath(major < 0 ? name : name.left(major)));
        m_environment = QProcessEnvironment::systemEnvironment();
        m_environment.insert(QStringLiteral("LD_BIND_NOW"), QStringLiteral("1"));
        m_environment.insert(QStringLiteral("LD_LIBRARY_PATH"), m_folder.path());
    }

    // Seconds to load the file in a new process; negative if it could not be loaded.
    double load(const QByteArray& file)
    {
        QProcess process;
        process.setProcessEnvironment(m_environment);
        process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
        process.start(QCoreApplication::applicationFilePath(),
            QStringList {QLatin1String(LoadOption), QFile::decodeName(file)});
        if (!process.waitForFinished() || process.exitStatus() != QProcess::NormalExit
            || process.exitCode() != 0) {
            return -1.0;
        }
        return process.readAllStandardOutput().trimmed().toDouble() * 1e-9;
    }

private:
    QTemporaryDir m_folder;
    QProcessEnvironment m_environment;
};

double median(std::vector<double>& values)
{
    std::nth_element(values.begin(), values.begin() + std::ptrdiff_t(values.size() / 2), values.end());
    return values[values.size() / 2];
}

QByteArray svgFile()
{
    const QString file = QLibraryInfo::location(QLibraryInfo::LibrariesPath) + QLatin1String("/libQt5Svg.so.5");
    return QFile::exists(file) ? QFile::encodeName(QFileInfo(file).canonicalFilePath()) : QByteArray();
}

void loadBesideSvg(benchmark::State& state)
{
    const QByteArray library = ZELKOV_WIDGETS_FILE;
    const QByteArray svg = svgFile();
    if (!library.contains(".so")) {
        state.SkipWithError("the library is built as an archive");
        return;
    }
    if (svg.isEmpty()) {
        state.SkipWithError("Qt5Svg is not installed");
        return;
    }
    Children children;
    // The first load of each brings the file into memory.
    if (children.load(library) < 0.0 || children.load(svg) < 0.0) {
        state.SkipWithError("a library could not be loaded");
        return;
    }
    std::vector<double> libraryTimes;
    std::vector<double> svgTimes;
    for (auto _ : state) {
        svgTimes.push_back(children.load(svg));
        libraryTimes.push_back(children.load(library));
        state.SetIterationTime(libraryTimes.back());
    }
    const double libraryTime = median(libraryTimes);
    const double svgTime = median(svgTimes);
    state.counters["subject_us"] = libraryTime * 1e6;
    state.counters["floor_us"] = svgTime * 1e6;
    state.counters["ratio"] = libraryTime / svgTime;
}
}

BENCHMARK(loadBesideSvg)
    ->Name("load_beside_Qt5Svg")
    ->UseManualTime()
    ->Iterations(LoadCount)
    ->Unit(benchmark::kMicrosecond);

int main(int argc, char* argv[])
{
    if (argc == 3 && std::strcmp(argv[1], LoadOption) == 0) {
        return load(argv[2]);
    }
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
