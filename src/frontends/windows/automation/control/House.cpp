#include "frontends/windows/automation/control/House.h"

namespace zandor::automation {

std::shared_ptr<House> House::build(Sink sink) {
    const std::shared_ptr<House> house(new House(std::move(sink)));
    house->mControl.emplace(*house->mToolkit, house->mLibrary, *house, house);
    house->mLibrary.serve(*house->mControl);
    house->mControl->UserControl_Resize();
    return house;
}

void House::end() {
    mSink = {};
    mControl->End();
}

} // namespace zandor::automation
