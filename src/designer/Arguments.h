#pragma once

#include "designer/shell/Task.h"

#include <QStringList>

namespace zandor::designer {

/// What the designer was asked on its command line.
struct Arguments {
    QString file = {};       ///< empty: the sample database
    QStringList tables = {}; ///< empty: the designer chooses
    QString screenshot = {}; ///< a file to draw the window into instead of staying open
    QString drawing = {};    ///< a query's file whose drawing is to be put into `picture`
    QString picture = {};
    bool asShown = false; ///< the picture's tables are as high as they are drawn
    bool dark = false;
    std::optional<shell::Task> task = {}; ///< to be done instead of opening a window
};

/// Reads the arguments behind the program's name.
reader::Result<Arguments> readArguments(const QStringList& arguments);

// Known before there is an application: help, the version and a task need no screen, pictures none
// that anybody sees.
bool asksForHelp(const QStringList& arguments);
bool asksForVersion(const QStringList& arguments);
bool asksForPicture(const QStringList& arguments);
bool asksForTask(const QStringList& arguments);

QString helpText();
QString versionText();

} // namespace zandor::designer
