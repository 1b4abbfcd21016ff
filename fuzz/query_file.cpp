#include "must.h"

#include <Zandor/QueryDocument.h>

#include <algorithm>

using namespace zandor;

/// Any bytes are a query that stays the same when it is saved and loaded, or an error of one line.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto document = files::fromJson({reinterpret_cast<const char*>(data), size});
    if (!document) {
        const std::string message = document.error();
        must(!message.empty() && message.size() < 500 && message.back() == '.', "a short message");
        must(std::all_of(message.begin(), message.end(),
                         [](char c) { return c >= 0x20 && c < 0x7f; }),
             "a message of one line");
        return 0;
    }
    const auto text = files::toJson(*document);
    if (!text) std::cerr << text.error() << '\n';
    must(static_cast<bool>(text), "what was loaded can be saved");
    const auto again = files::fromJson(*text);
    must(static_cast<bool>(again), "what was saved can be loaded");
    must(again->query->record() == document->query->record(), "the query is the same");
    const auto textAgain = files::toJson(*again);
    must(textAgain && *textAgain == *text, "the file is the same");
    return 0;
}
