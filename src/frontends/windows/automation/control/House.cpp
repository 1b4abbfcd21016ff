#include "frontends/windows/automation/control/House.h"

namespace zandor::automation {

std::shared_ptr<House> House::build(Sink sink) {
    std::shared_ptr<House> house(new House(std::move(sink)));
    house->mControl.emplace(house->mHidden.handle(), house->mLibrary, *house, house);
    house->mZandor = &house->mControl->control();
    house->mLibrary.serve(*house->mZandor);
    return house;
}

void House::end() {
    mSink = {};
    mControl.reset();
}

} // namespace zandor::automation
