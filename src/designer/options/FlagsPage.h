#pragma once

#include "designer/options/ControlProperties.h"

#include <QWidget>

#include <utility>

class QCheckBox;
class QVBoxLayout;

namespace zandor::designer {

class ControlOptions;

/// The options dialog's page of switches: a box for each property of that page.
class FlagsPage final : public QWidget {
    Q_OBJECT

public:
    FlagsPage(ControlProperty::Page page, const QString& explanation, QWidget* parent = nullptr);

    void setOptions(const ControlOptions& options);
    void collect(ControlOptions& options) const;

signals:
    void edited();

private:
    struct Flag {
        const ControlProperty* property;
        QCheckBox* box;
    };
    /// The boxes of one list in the join dialog, and the warning below them.
    struct Offer {
        std::vector<QCheckBox*> boxes;
        QWidget* warning;
    };

    void addOffer(QVBoxLayout& layout, const QString& title, const QString& prefix);
    void addFlag(QLayout& layout, const ControlProperty& property);
    void warn();

    ControlProperty::Page mPage;
    std::vector<Flag> mFlags;
    std::vector<Offer> mOffers;
};

} // namespace zandor::designer
