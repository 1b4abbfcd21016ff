#pragma once

#include <QStringList>
#include <QTemporaryDir>

/// A home of a user's own, without settings; the words of the program are English ones.
class Home {
public:
    QString path() const { return mFolder.path(); }
    QString filePath(const QString& name) const { return mFolder.filePath(name); }

    QStringList environment() const {
        return {"HOME=" + path(), "XDG_CONFIG_HOME=" + filePath("config"),
                "XDG_DATA_HOME=" + filePath("data"), "LC_ALL=C.UTF-8", "LANGUAGE=en"};
    }

private:
    QTemporaryDir mFolder;
};
