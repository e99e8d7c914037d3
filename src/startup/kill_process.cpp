#include "startup/kill_process.h"

#include "common/text.h"

namespace checker {

bool fnImageNameMatches(std::string_view imageName, std::string_view name) {
    const std::string image = lowerAscii(imageName.substr(0, imageName.find('\0')));
    const std::string wanted = lowerAscii(name);
    if (wanted.size() > image.size()) return false;
    return image.compare(image.size() - wanted.size(), wanted.size(), wanted) == 0;
}

void KillProcessByName(ProcessesPort& processes, std::string_view name) {
    if (name.empty()) return;
    // The running process itself is not spared: a tail match on it ends it too.
    for (const ProcessEntry& entry : processes.snapshot())
        if (fnImageNameMatches(entry.imageName, name)) processes.terminate(entry.processId);
}

} // namespace checker
