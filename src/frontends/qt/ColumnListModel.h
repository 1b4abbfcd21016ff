#pragma once

#include "frontends/qt/EntryTexts.h"

#include <Zandor/comforts/Spoken.h>
#include <Zandor/platform/ImageList.h>
#include <Zandor/platform/Words.h>

#include <QAbstractListModel>

#include <memory>
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

    QString text(int row) const;
    std::optional<Picture> picture(int row) const { return at(row).picture; }
    void append(StringView text, StringView key = {});
    /// Gives back what there was room for beyond the last entry.
    void squeeze();
    /// Of the rows; whoever shares them may outlive the model.
    const std::shared_ptr<EntryTexts>& texts() const { return mTexts; }
    void setPicture(int row, std::optional<Picture> picture);
    void setComesOut(int row, bool comesOut);
    void clear();
    void setWords(const Words& words) { mWords = comforts::EntryWords(words); }

private:
    struct Row {
        std::optional<Picture> picture;
        bool comesOut = false;
    };

    QVariant description(const Row& row) const;
    Row& at(int row) { return mRows[static_cast<std::size_t>(row)]; }
    const Row& at(int row) const { return mRows[static_cast<std::size_t>(row)]; }

    std::shared_ptr<EntryTexts> mTexts = std::make_shared<EntryTexts>();
    std::vector<Row> mRows;
    comforts::EntryWords mWords;
};

} // namespace zandor::platform::qt
