// The stages of the picture path, one picture of 12 megapixels: what each costs, and each kind of vectors.

#include "Floor.h"
#include "imaging/files/JpegWriter.h"
#include "imaging/scaling/Resample.h"
#include "samples/SamplePhotographs.h"

#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <cstdlib>

using namespace lumora;

namespace {

constexpr PictureSize paper{1800, 1350};

const std::filesystem::path& photograph() {
    static const QTemporaryDir folder;
    static const std::filesystem::path path = [] {
        const auto paths = writeSamplePhotographs(folder.path().toStdString(), 1);
        if (!paths)
            std::abort();
        return paths->front();
    }();
    return path;
}

std::unique_ptr<JpegReader> reader() {
    return readerOf(photograph());
}

void decodeToPlanes(benchmark::State& state) {
    for (auto _ : state) {
        DroppedPlanes planes;
        if (!reader()->readPlanes(static_cast<int>(state.range(0)), planes))
            state.SkipWithError("not read");
    }
}
BENCHMARK(decodeToPlanes)->ArgName("denominator")->Arg(1)->Arg(2)->Arg(8)->Unit(benchmark::kMillisecond);

void encodeFromPlanes(benchmark::State& state) {
    // The planes of the real result, so that the encoder has real work.
    const auto bytes = scalePictureToJpeg(photograph(), paper, 95);
    const QTemporaryDir folder;
    const std::filesystem::path path = folder.path().toStdString() + "/a.jpg";
    if (!bytes)
        return state.SkipWithError("not made");
    writeBytes(path, *bytes);
    for (auto _ : state) {
        PictureTimes times;
        if (!scalePictureToJpeg(path, paper, 90, &times))
            state.SkipWithError("not written");
        state.SetIterationTime(times.encode / 1000);
    }
}
BENCHMARK(encodeFromPlanes)->UseManualTime()->Unit(benchmark::kMillisecond);

void resizeBetween(benchmark::State& state) {
    for (auto _ : state) {
        PictureTimes times;
        if (!scalePictureToJpeg(photograph(), paper, 90, &times))
            state.SkipWithError("not written");
        state.SetIterationTime(times.draw / 1000);
    }
}
BENCHMARK(resizeBetween)->UseManualTime()->Unit(benchmark::kMillisecond);

void toPaper(benchmark::State& state, const ResampleKernels& kernels) {
    for (auto _ : state) {
        if (!readResampledToJpeg(*reader(), paper, 90, kernels))
            state.SkipWithError("not scaled");
    }
}

void smallPicture(benchmark::State& state) {
    for (auto _ : state) {
        if (!loadPictureScaled(photograph(), {115, 86}))
            state.SkipWithError("not scaled");
    }
}
BENCHMARK(smallPicture)->Unit(benchmark::kMillisecond);

void twelveSmallPictures(benchmark::State& state) {
    const std::vector<std::filesystem::path> paths(12, photograph());
    for (auto _ : state)
        benchmark::DoNotOptimize(loadSmallPictures(paths, 115));
}
BENCHMARK(twelveSmallPictures)->UseRealTime()->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char** argv) {
    static const auto all = allKernels();
    for (const NamedKernels& one : all)
        benchmark::RegisterBenchmark(("toPaper/" + one.name).c_str(), toPaper, one.kernels)
            ->Unit(benchmark::kMillisecond);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
