#include "designer/show/DrawingPicture.h"

#include "designer/canvasSize.h"
#include "frontends/qt/TabuletWidget.h"

#include <QPainter>

#include <algorithm>
#include <limits>

namespace zandor::designer {

namespace {

/// Room for the control's scroll bars, which are not part of the picture.
constexpr QSize besideCanvas(60, 60);
constexpr int canvasEnd = std::numeric_limits<std::int16_t>::max();

using platform::qt::TabuletWidget;
using Tables = platform::Each<TalvikZandorLib::ZDTable>;

/// Black on white, whatever the window's colours are.
QPalette pagePalette() {
    QPalette palette(Qt::black, Qt::white, Qt::white, Qt::gray, Qt::lightGray, Qt::black, Qt::white,
                     Qt::white, Qt::white);
    palette.setColor(QPalette::Highlight, Qt::gray);
    return palette;
}

void unselect(model::Query& query) {
    for (const auto& table : Tables(query.Tables()))
        for (const auto& column : platform::Each<TalvikZandorLib::ZDColumn>(table->Columns()))
            column->Selected(false);
}

/// What the height of a box has to change by, in twips, so that its list shows all of its rows or
/// ends with a whole one: the list would scroll, and SVG knows no clipping.
int growth(const TabuletWidget& box, DrawingPicture::Rows rows) {
    const int row = box.list().rowHeight();
    const int height = box.list().viewport()->height();
    const int needed = box.list().model()->rowCount() * row;
    if (row <= 0 || needed <= height) return 0;
    return (rows == DrawingPicture::Rows::all ? needed - height : -(height % row)) * twipsPerPixel;
}

bool areAbove(const QRect& upper, const QRect& lower) {
    return upper.bottom() < lower.top() && upper.left() <= lower.right() &&
           lower.left() <= upper.right();
}

/// Gives the tables other heights; what stands below one that grows keeps its distance from it.
void grow(model::Query& query, const std::vector<int>& growths) {
    struct Standing {
        platform::Ref<TalvikZandorLib::ZDTable> table;
        QRect before;
        int growth;
        int down = 0;
    };
    std::vector<Standing> all;
    for (const auto& table : Tables(query.Tables()))
        all.push_back({table, QRect(table->Left(), table->Top(), table->Width(), table->Height()),
                       growths[all.size()]});
    std::ranges::sort(all, {}, [](const Standing& each) { return each.before.top(); });
    for (std::size_t n = 0; n < all.size(); ++n) {
        Standing& own = all[n];
        for (std::size_t m = 0; m < n; ++m)
            if (areAbove(all[m].before, own.before))
                own.down = std::max(own.down, all[m].down + std::max(all[m].growth, 0));
        const int top = std::min(own.before.top() + own.down, canvasEnd - own.before.height());
        own.table->Top(static_cast<float>(top));
        own.table->Height(
            static_cast<float>(std::min(own.before.height() + own.growth, canvasEnd - top)));
    }
}

} // namespace

DrawingPicture::DrawingPicture(const model::Query& query, const QVariantMap& options, Rows rows)
    : mControl(std::make_unique<ZandorWidget>(mLibrary)) {
    // A copy, for the control notes in its model what it shows and selects.
    const auto copy = model::Query::restored(query.record());
    unselect(*copy);
    mControl->setAttribute(Qt::WA_DontShowOnScreen);
    mControl->setPalette(pagePalette());
    mControl->setComforts(comforts::Flags::all()); // what they show is part of the drawing
    mControl->setDebugSwitch(0);
    for (auto option = options.begin(); option != options.end(); ++option)
        mControl->setProperty(option.key().toLatin1().constData(), option.value());
    mControl->setDebugSwitch(0); // a picture is no place for boxes
    bind(copy);
    mControl->show();
    // How high a row is, only the boxes know. Cut off what still does not go in.
    for (const Rows each : {rows, Rows::asDrawn}) {
        std::vector<int> growths;
        for (const auto& table : Tables(copy->Tables())) {
            growths.push_back(0);
            for (const auto* box : mControl->findChildren<TabuletWidget*>())
                if (box->pos() == QPoint(table->Left(), table->Top()) / twipsPerPixel)
                    growths.back() = growth(*box, each);
        }
        if (std::ranges::all_of(growths, [](int one) { return one == 0; })) continue;
        grow(*copy, growths);
        bind(copy);
    }
}

DrawingPicture::~DrawingPicture() = default;

void DrawingPicture::bind(const platform::Ref<model::Query>& query) {
    mSize = pixels(canvasNeeded(*query));
    mControl->resize(mSize + besideCanvas);
    mControl->setMXHorzFrameSize(twips(mControl->width()));
    mControl->setMXVertFrameSize(twips(mControl->height()));
    mControl->setOnlyJoin(true);
    mControl->setModel(query);
    for (auto* box : mControl->findChildren<TabuletWidget*>()) {
        box->setCurrent(false);
        box->closeButton().hide();
        box->list().setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        box->list().setCurrentIndex({});
    }
}

void DrawingPicture::render(QPainter& painter) const {
    mControl->render(&painter, QPoint(), QRegion(QRect(QPoint(), mSize)));
}

} // namespace zandor::designer
