#pragma once

#include <Zandor/comforts/Comforts.h>

class QDialog;

namespace zandor::platform::qt {

/// Adds a line to the join dialog that says in words what is chosen there, and follows the choice.
void addJoinSentence(QDialog& dialog, const comforts::Comforts& comforts);

} // namespace zandor::platform::qt
