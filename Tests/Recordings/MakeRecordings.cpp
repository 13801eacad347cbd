// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recordings/ExampleRecording.h"

#include <cstdio>
#include <filesystem>

/// Regenerates the recordings of this folder: make-recordings DIRECTORY.
int main(int count, char** arguments) {
    if (count != 2) {
        std::fprintf(stderr, "usage: make-recordings DIRECTORY\n");
        return 2;
    }
    const std::filesystem::path directory = arguments[1];
    for (const velmora::ExampleRecording& recording : velmora::exampleRecordings()) {
        const std::string path = directory / recording.fileName();
        if (const auto written = recording.write(path); !written) {
            std::fprintf(stderr, "make-recordings: %s\n", written.reason().c_str());
            return 1;
        }
    }
    return 0;
}
