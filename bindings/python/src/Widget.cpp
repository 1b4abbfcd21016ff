#include "sipAPI_zandor.h"

#include "Host.h"
#include "Widget.h"

namespace zandor::python {

// What was there before goes last: with a Python object whatever its program does then may go.
void Widget::setLibrary(const LibraryRef& library) {
    const LibraryRef before = std::exchange(mEnd->library, library);
    ZandorWidget::setLibrary(*library);
}

void Widget::setQuestions(const QuestionsRef& questions) {
    const QuestionsRef before = std::exchange(mQuestions, questions);
    ZandorWidget::setQuestions(questions);
}

int Widget::visit(visitproc visit, void* argument) const {
    const auto* const base = reinterpret_cast<const sipClassTypeDef*>(sipType_QObject);
    if (base->ctd_traverse)
        if (const int result = base->ctd_traverse(const_cast<Widget*>(this), visit, argument))
            return result;
    for (const auto* host :
         {dynamic_cast<const Host*>(model().get()), dynamic_cast<const Host*>(mEnd->library.get())})
        if (host)
            if (const int result = visit(host->object(), argument)) return result;
    return mQuestions ? mQuestions->visit(visit, argument) : 0;
}

} // namespace zandor::python
