#pragma once

#include "designer/options/ControlOptions.h"

#include <QDialog>

class QDialogButtonBox;
class QSettings;

namespace zandor::designer {

class FlagsPage;
class TextsPage;

/// The options of the control. They are kept in the settings and take effect at once with OK and
/// Apply.
class OptionsDialog final : public QDialog {
    Q_OBJECT

public:
    /// The settings outlive the dialog.
    explicit OptionsDialog(QSettings& settings, QWidget* parent = nullptr);

signals:
    /// The options have been changed and are in the settings.
    void applied(const designer::ControlOptions& options);

private:
    void setOptions(const ControlOptions& options);
    ControlOptions collected() const;
    void apply();
    void offerApply();

    QSettings& mSettings;
    ControlOptions mInForce;
    TextsPage* mTexts;
    FlagsPage* mMenu;
    FlagsPage* mJoins;
    FlagsPage* mDebug;
    QDialogButtonBox* mButtons;
};

} // namespace zandor::designer
