#pragma once

#include <QCoreApplication>

namespace zandor::designer::shell {

/// The words of what works without a window.
class Words {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::shell)
};

} // namespace zandor::designer::shell
