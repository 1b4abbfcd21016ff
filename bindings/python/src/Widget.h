#pragma once

#include "adapters.h"

#include <Zandor/ZandorWidget.h>

#include <QVariant>

/// A library as a widget takes it (see libraryOf in references.h).
using LibraryRef = std::shared_ptr<TalvikZandorLib::Library>;

namespace zandor::python {

/// The widget, which keeps its library for as long as it is there.
class Widget : public ZandorWidget {
public:
    explicit Widget(const LibraryRef& library, QWidget* parent = nullptr)
        : ZandorWidget(*library, parent), mLibrary(library) {
        // What such a property holds is the last of a QObject to go.
        setProperty("zandorEnd", QVariant::fromValue(std::make_shared<End>(library)));
    }
    ~Widget() override { Ending::begin(); }

    /// Shows Python's garbage collector the objects that only the control holds: the model and the
    /// library, where they are written in Python. Each has an adapter of this widget's own.
    int visit(visitproc visit, void* argument) const;

private:
    /// What comes last.
    struct End {
        explicit End(LibraryRef library) : library(std::move(library)) {}
        ~End() {
            library.reset();
            Ending::end();
        }
        LibraryRef library;
    };

    const LibraryRef mLibrary;
};

} // namespace zandor::python

using zandor::python::Widget;
