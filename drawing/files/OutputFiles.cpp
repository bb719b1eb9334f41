// SPDX-License-Identifier: MIT
#include "drawing/files/OutputFiles.h"

#include <algorithm>
#include <cctype>
#include <filesystem>

#include "drawing/InputError.h"
#include "drawing/dxf/DxfWriter.h"
#include "drawing/svg/ResultPicture.h"

namespace gmdrawing {

namespace {

bool isSameFile(const std::string& a, const std::string& b) {
    std::error_code error;
    return std::filesystem::weakly_canonical(a, error) ==
           std::filesystem::weakly_canonical(b, error);
}

std::string alternatives(const std::vector<std::string>& endings) {
    std::string text;
    for (const std::string& ending : endings)
        text += (text.empty() ? "" : " or ") + ending;
    return text;
}

AtomicFile written(const std::vector<OutputFormat>& formats, const std::string& name) {
    AtomicFile file(name);
    const std::string ending = endingOf(name);
    for (const OutputFormat& format : formats) {
        if (format.ending == ending) format.write(file);
    }
    file.synchronise();
    return file;
}

void writeWholeDxf(const ResultDrawing& drawing, const AtomicFile& file) {
    if (!writeDxf(drawing, file.besideName())) {
        throw InputError(file.name() + ": cannot be written as a whole");
    }
}

}  // namespace

std::string endingOf(const std::string& name) {
    std::string ending = std::filesystem::path(name).extension().string();
    std::transform(ending.begin(), ending.end(), ending.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return ending;
}

void checkOutputs(const std::vector<std::string>& names, const std::string& inputName,
                  const std::vector<std::string>& endings) {
    for (std::size_t i = 0; i < names.size(); ++i) {
        const std::string& name = names[i];
        if (std::find(endings.begin(), endings.end(), endingOf(name)) == endings.end()) {
            throw InputError(name + ": the ending of an output is " + alternatives(endings));
        }
        if (isSameFile(name, inputName)) throw InputError(name + ": is the drawing that is read");
        for (std::size_t j = 0; j < i; ++j) {
            if (isSameFile(name, names[j])) throw InputError(name + ": given twice as output");
        }
        const AtomicFile probe(name);  // removed again at once
    }
}

void writeOutputs(const std::vector<OutputFormat>& formats, const std::vector<std::string>& names) {
    std::vector<AtomicFile> files;
    for (const std::string& name : names)
        files.push_back(written(formats, name));
    for (AtomicFile& file : files)
        file.commit();
}

void writeOutputs(const ResultDrawing& drawing, const std::vector<std::string>& names) {
    writeOutputs({{".svg", [&](AtomicFile& file) { file.write(svgOf(drawing)); }},
                  {".dxf", [&](const AtomicFile& file) { writeWholeDxf(drawing, file); }}},
                 names);
}

}  // namespace gmdrawing
