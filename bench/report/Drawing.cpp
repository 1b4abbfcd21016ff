#include "Drawing.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/TabuletWidget.h"

namespace report {

using namespace zandor;

Drawing::Drawing(const platform::Ref<model::Query>& query)
    : mWidget(std::make_unique<ZandorWidget>(mLibrary)),
      mPainted(std::make_unique<Painted>(*mWidget)) {
    mWidget->setDebugSwitch(0);
    mWidget->setMXHorzFrameSize(Setting::canvas.width() * 15);
    mWidget->setMXVertFrameSize(Setting::canvas.height() * 15);
    mWidget->resize(Setting::window);
    mWidget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(query));
    mWidget->show();
    mPainted->wait();
}

Drawing::~Drawing() = default;

platform::qt::Canvas& Drawing::canvas() {
    auto* const canvas = mWidget->findChild<platform::qt::Canvas*>();
    if (!canvas) qFatal("the widget has no canvas");
    return *canvas;
}

platform::qt::TabuletWidget& Drawing::table(int number) {
    return *canvas().tables().at(static_cast<std::size_t>(number));
}

} // namespace report
