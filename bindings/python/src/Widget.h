#pragma once

#include "PythonQuestions.h"
#include "adapters.h"

#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>

#include <QVariant>

/// A library as a widget takes it (see libraryOf in references.h).
using LibraryRef = std::shared_ptr<TalvikZandorLib::Library>;

namespace zandor::python {

/// The widget, which keeps its library for as long as it is there.
class Widget : public ZandorWidget {
public:
    explicit Widget(const LibraryRef& library, QWidget* parent = nullptr)
        : ZandorWidget(*library, parent), mEnd(std::make_shared<End>(library)) {
        // What such a property holds is the last of a QObject to go.
        setProperty("zandorEnd", QVariant::fromValue(mEnd));
    }
    /// With the ready-made library, for forms, which know of a parent only.
    explicit Widget(QWidget* parent = nullptr)
        : Widget(std::make_shared<model::Library>(), parent) {}
    ~Widget() override { Ending::begin(); }

    void setLibrary(const LibraryRef& library);
    void setQuestions(const QuestionsRef& questions);

    /// Shows Python's garbage collector the objects that only the control holds: the model and the
    /// library, where they are written in Python, and whom it asks. Each has an adapter of this
    /// widget's own.
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

    const std::shared_ptr<End> mEnd;
    QuestionsRef mQuestions;
};

} // namespace zandor::python

using zandor::python::Widget;
