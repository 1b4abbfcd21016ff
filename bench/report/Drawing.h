#pragma once

#include "Painted.h"
#include "Setting.h"

#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>

namespace zandor::platform::qt {
class Canvas;
class TabuletWidget;
} // namespace zandor::platform::qt

namespace report {

/// The setting as the control shows it, in a window of its own.
class Drawing {
public:
    explicit Drawing(const Setting& setting) : Drawing(setting.query()) {}
    /// Of a query that is there already: what a host has before it shows anything.
    explicit Drawing(const zandor::platform::Ref<zandor::model::Query>& query);
    ~Drawing();

    ZandorWidget& widget() { return *mWidget; }
    Painted& painted() { return *mPainted; }
    zandor::platform::qt::Canvas& canvas();
    zandor::platform::qt::TabuletWidget& table(int number);

private:
    zandor::model::Library mLibrary;
    std::unique_ptr<ZandorWidget> mWidget;
    std::unique_ptr<Painted> mPainted;
};

} // namespace report
