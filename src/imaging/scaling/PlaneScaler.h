#pragma once

#include "imaging/scaling/ResampleKernels.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <new>
#include <vector>

namespace lumora {

// One direction of a plane, in samples.
struct PlaneAxis {
    int source = 0; // samples of the picture, without padding
    int target = 0;
    double step = 1; // source samples between two target samples
    int first = 0;   // position of the first target sample; target samples may lie beyond the source
    bool operator==(const PlaneAxis&) const = default;
};

// Weights of an antialiased bicubic (a = -0.5, the kernel widened by the shrink), 14 fraction bits. The weights of a
// target sample sum to exactly 16384, so that a flat picture stays flat to the last bit. Outside the source its edge is
// repeated.
struct CubicWeights {
    int taps = 0;                      // the same for each target sample
    std::vector<std::int32_t> first;   // source sample of the first weight
    std::vector<std::int16_t> weights; // taps for each target sample

    // The centre of sample k lies at k + 0.5 in source and target.
    static CubicWeights make(const PlaneAxis& axis);
};

// Zeroed memory for samples, aligned to 64 bytes for vector loads.
template <class Sample>
class SampleBuffer {
public:
    explicit SampleBuffer(std::size_t count)
        : m_data(static_cast<Sample*>(::operator new(count * sizeof(Sample), alignment))) {
        std::uninitialized_value_construct_n(m_data.get(), count);
    }
    Sample* data() { return m_data.get(); }
    const Sample* data() const { return m_data.get(); }

private:
    static constexpr std::align_val_t alignment{64};
    struct Free {
        void operator()(Sample* data) const { ::operator delete(data, alignment); }
    };
    std::unique_ptr<Sample, Free> m_data;
};

// Scales one plane of bytes while its rows come in from the top; keeps only the rows that are still needed.
class PlaneScaler {
public:
    // The giver writes rowsAtOnce rows of rowBytes bytes before each call of rowsReady. like is another plane of the
    // picture, whose weights are shared if its axes are the same.
    PlaneScaler(PlaneAxis across, PlaneAxis down, int rowsAtOnce, int rowBytes,
                const ResampleKernels& kernels = bestKernels(), const PlaneScaler* like = nullptr);

    // The rows and columns of the source that have weight; only these must be written.
    struct Range {
        int begin;
        int end;
    };
    Range inputRows() const;
    Range inputColumns() const { return {m_weights->columnBegin, m_weights->columnBegin + m_weights->columnCount}; }

    // Where the giver writes row y; y may pass the picture's end by padding.
    std::uint8_t* inputRow(int y) { return m_input.data() + (y % m_inputRows) * m_inputStride; }
    // Tells that all rows above end are written.
    void rowsReady(int end);

    // Rows of the target below this number are ready, each padded with its last sample to a multiple of 8.
    int outputEnd() const { return m_outputEnd; }
    // y is at least the last released row and less than outputEnd().
    std::uint8_t* outputRow(int y) { return m_output.data() + (y - m_outputBegin) * m_outputStride; }
    // Tells that rows below y are no longer needed.
    void release(int y);

private:
    // The weights in the order that the kernels read.
    struct Weights {
        PlaneAxis across;
        PlaneAxis down;
        CubicWeights rows;
        int columnBegin = 0; // first source column with weight
        int columnCount = 0;
        std::vector<std::int32_t> firstPair;
        std::vector<std::int16_t> pairWeights;
        int pairs = 0;

        Weights(const PlaneAxis& across, const PlaneAxis& down, int outputCount);
    };
    void finishBlock(int rows);

    const ResampleKernels& m_kernels;
    PlaneAxis m_down;
    int m_outputCount = 0; // samples of a target row, rounded up to 8
    std::shared_ptr<const Weights> m_weights;

    int m_inputRows = 0;
    std::ptrdiff_t m_inputStride = 0;
    SampleBuffer<std::uint8_t> m_input;
    std::vector<const std::uint8_t*> m_taps;

    std::ptrdiff_t m_blendedStride = 0;
    SampleBuffer<std::int16_t> m_blended;
    int m_blendedRows = 0;
    SampleBuffer<std::int16_t> m_columns;

    std::ptrdiff_t m_outputStride = 0;
    std::vector<std::uint8_t> m_output;
    int m_outputBegin = 0;
    int m_outputEnd = 0;
};

} // namespace lumora
