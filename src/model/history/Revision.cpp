#include <Zandor/model/Revision.h>

namespace zandor::model {

std::vector<const Revision*> ChangeLog::since(Moment moment) const {
    std::vector<const Revision*> changed;
    for (const Entry& entry : mEntries) {
        if (entry.changed <= moment) break;
        changed.push_back(entry.revision);
    }
    return changed;
}

Revision::~Revision() {
    if (mLog) mLog->mEntries.erase(mEntry);
}

void Revision::enter(const std::shared_ptr<ChangeLog>& log) {
    if (!mLog) {
        mEntry = log->mEntries.insert(log->mEntries.begin(), {this, 0});
        mLog = log;
    }
    raise();
}

void Revision::raise() {
    if (!mLog) return;
    mEntry->changed = ++mLog->mNow;
    mLog->mEntries.splice(mLog->mEntries.begin(), mLog->mEntries, mEntry);
}

} // namespace zandor::model
