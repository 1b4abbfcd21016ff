#pragma once

#include <QCoreApplication>

namespace designer::shell {

/// The words of what works without a window.
class Words {
    Q_DECLARE_TR_FUNCTIONS(designer::shell)
};

} // namespace designer::shell
