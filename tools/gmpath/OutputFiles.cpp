#include "OutputFiles.h"

#include <algorithm>
#include <cctype>
#include <filesystem>

#include "AtomicFile.h"
#include "DxfWriter.h"
#include "InputError.h"
#include "SvgWriter.h"

namespace gmpath {

namespace {

std::string endingOf(const std::string& name) {
    std::string ending = std::filesystem::path(name).extension().string();
    std::transform(ending.begin(), ending.end(), ending.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return ending;
}

bool isSameFile(const std::string& a, const std::string& b) {
    std::error_code error;
    return std::filesystem::weakly_canonical(a, error) ==
           std::filesystem::weakly_canonical(b, error);
}

AtomicFile written(const OffsetDrawing& drawing, const std::string& name) {
    AtomicFile file(name);
    if (endingOf(name) == ".svg") {
        file.write(svgOf(drawing));
    } else if (!writeDxf(drawing, file.besideName())) {
        throw InputError(name + ": cannot be written as a whole");
    }
    return file;
}

}  // namespace

void checkOutputs(const std::vector<std::string>& names, const std::string& inputName) {
    for (std::size_t i = 0; i < names.size(); ++i) {
        const std::string& name = names[i];
        const std::string ending = endingOf(name);
        if (ending != ".svg" && ending != ".dxf") {
            throw InputError(name + ": the ending of an output is .svg or .dxf");
        }
        if (isSameFile(name, inputName)) throw InputError(name + ": is the drawing that is read");
        for (std::size_t j = 0; j < i; ++j) {
            if (isSameFile(name, names[j])) throw InputError(name + ": given twice as output");
        }
        const AtomicFile probe(name);  // removed again at once
    }
}

void writeOutputs(const OffsetDrawing& drawing, const std::vector<std::string>& names) {
    std::vector<AtomicFile> files;
    for (const std::string& name : names)
        files.push_back(written(drawing, name));
    for (AtomicFile& file : files)
        file.commit();
}

}  // namespace gmpath
