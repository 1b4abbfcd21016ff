#pragma once

#include "designer/run/Command.h"

#include <QDialog>

class QDialogButtonBox;
class QLabel;
class QLineEdit;

namespace zandor::designer {

/// Asks for the values of a query's parameters.
class ParameterDialog final : public QDialog {
    Q_OBJECT

public:
    /// The fields hold the answers that there are already.
    ParameterDialog(std::vector<Question> questions, const Answers& answers,
                    QWidget* parent = nullptr);

    Answers answers() const;

private:
    void check();

    const std::vector<Question> mQuestions;
    std::vector<QLineEdit*> mFields; ///< one a question
    QLabel* mComplaint;
    QDialogButtonBox* mButtons;
};

} // namespace zandor::designer
