#pragma once

#include <Zandor/platform/ImageList.h>
#include <Zandor/platform/Words.h>

#include <QAbstractListModel>

#include <vector>

namespace zandor::platform::qt {

/// The rows of a table list as the view sees them.
class ColumnListModel : public QAbstractListModel {
public:
    /// What the image before the name shows, as a number; nothing without one.
    static constexpr int pictureRole = Qt::UserRole;
    /// Whether the column comes out in the query's rows.
    static constexpr int outputRole = Qt::UserRole + 1;

    using QAbstractListModel::QAbstractListModel;

    int rowCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;

    const QString& text(int row) const { return mRows[static_cast<std::size_t>(row)].text; }
    std::optional<Picture> picture(int row) const { return at(row).picture; }
    void append(const QString& text);
    void setPicture(int row, std::optional<Picture> picture);
    void setComesOut(int row, bool comesOut);
    void clear();
    void setWords(const Words& words);

private:
    struct Row {
        QString text;
        std::optional<Picture> picture;
        bool comesOut = false;
    };

    QVariant description(const Row& row) const;
    Row& at(int row) { return mRows[static_cast<std::size_t>(row)]; }
    const Row& at(int row) const { return mRows[static_cast<std::size_t>(row)]; }

    std::vector<Row> mRows;
    QString mKeyColumn;
    QString mComesOut;
};

} // namespace zandor::platform::qt
