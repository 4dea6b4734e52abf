#pragma once

#include <cmath>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <vector>

// One edited print as every program here makes it: a picture on 10/15, turned 7 degrees clockwise about the middle of
// the paper, zoomed, toned, under a frame and a caption. Called as PROGRAM ZOOM jpeg|pixels FOLDER FRAMES FILE...;
// "pixels" leaves out tone, frame and caption and writes a PNG, which tells how well the picture itself is drawn.
struct Job {
    static constexpr int paperWidth = 1500;
    static constexpr int paperHeight = 1000;
    static constexpr double degrees = 7;
    static constexpr double red = 1.06, green = 1, blue = 0.94, cross = 0.001;
    static constexpr int quality = 90;
    static constexpr const char* caption = "Lumora 2024";
    static constexpr int captionX = 100, captionY = 833, captionSize = 80; // in print pixels; yellow over its shadow

    int zoom = 100;
    bool pixelsOnly = false;
    std::filesystem::path out;
    std::filesystem::path frames; // holds bench/f.bmp (black is transparent) and bench/f.png (the same with alpha)
    std::vector<std::filesystem::path> files;

    static Job of(int argc, char** argv) {
        if (argc < 6)
            std::exit(2);
        Job job;
        job.zoom = std::atoi(argv[1]);
        job.pixelsOnly = std::string(argv[2]) == "pixels";
        job.out = argv[3];
        job.frames = std::filesystem::path(argv[4]) / "bench";
        job.files.assign(argv + 5, argv + argc);
        return job;
    }

    // At zoom 130 the turned picture covers the paper; at 100 its corners stay free.
    bool covers() const { return zoom >= 130; }
    std::filesystem::path target(const std::filesystem::path& file) const {
        return out / (file.stem().string() + (pixelsOnly ? ".png" : ".jpg"));
    }
    // Of a picture of 4:3 that lies, which is drawn 1500 x 1125 at zoom 100.
    int width() const { return static_cast<int>(std::nearbyint(paperWidth * zoom / 100.0)); }
    int height() const { return static_cast<int>(std::nearbyint(1125 * zoom / 100.0)); }
};
