#pragma once

#include "designer/run/fetch.h"

#include <Zandor/files/Output.h>

namespace zandor::designer {

/// Writes rows as an array of objects, an object a line: UTF-8. A blob is a text in Base64. Of
/// columns with one name the later ones get "_2", "_3" behind it.
class JsonWriter final : public Sink {
public:
    /// The output outlives the writer.
    explicit JsonWriter(files::Output& output) : mOutput(output) {}

    std::optional<QString> begin(const QStringList& columns) override;
    std::optional<QString> add(const Row& row) override;
    std::optional<QString> finish() override;

private:
    std::optional<QString> write(std::string_view bytes);

    files::Output& mOutput;
    std::vector<QByteArray> mNames; ///< with quotes and colon
    QByteArray mLine;
    bool mAny = false;
};

} // namespace zandor::designer
