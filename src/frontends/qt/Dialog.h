#pragma once

#include "frontends/qt/Adapter.h"

#include <Zandor/platform/Intrinsic.h>

#include <QDialog>
#include <QLineEdit>

class QFormLayout;
class QHBoxLayout;

namespace zandor::platform::qt {

/// A text to be looked at, with room for all of it within reason.
class NameBox : public QLineEdit {
public:
    explicit NameBox(QWidget* parent);

    QSize minimumSizeHint() const override;
};

/// A form: labels and fields pair up in the order of their making, buttons stand in a row below.
class FormDialog : public QDialog {
public:
    FormDialog(QWidget* parent, PlainEvent Close);

    void place(QWidget* child, Role role);
    /// Gives the focus to what can be changed, or else to the button that Enter presses.
    void focusFirst();
    void setCloseEvent(PlainEvent Close) { mClose = std::move(Close); }
    /// Called when the form is filled and about to be shown.
    using Preparation = std::function<void(QDialog&)>;
    void setPreparation(Preparation preparation) { mPreparation = std::move(preparation); }
    void prepare() {
        if (mPreparation) mPreparation(*this);
    }

    QSize sizeHint() const override;
    /// Escape and the close button of the frame both come here.
    void reject() override;

private:
    QFormLayout* mForm;
    QHBoxLayout* mButtons;
    int mLabels = 0;
    int mFields = 0;
    PlainEvent mClose;
    Preparation mPreparation;
};

class DialogAdapter final : public Adapter<platform::Dialog, FormDialog> {
public:
    using Adapter::Adapter;
    ~DialogAdapter() override;

    void place(QWidget* child, Role role) override;
    void Caption(const String& value) override;
    void ShowModal() override;
    void Hide() override;
};

} // namespace zandor::platform::qt
