#include "loading.h"

namespace hmirules {

std::unique_ptr<RuleBase> loadRules(const QList<QByteArray> &paths, Fault *fault)
{
    std::vector<RuleFile> files;
    for (const QByteArray &path : paths) {
        RuleFile file;
        if (!file.read(path, fault)) {
            return nullptr;
        }
        files.push_back(std::move(file));
    }
    return std::make_unique<RuleBase>(std::move(files));
}

} // namespace hmirules
