#pragma once

#include "platform/Toolkit.h"

#include <vector>

/// Message boxes that nobody sees, for classes that need no more of a toolkit.
class RecordingBoxes : public platform::MessageBoxes {
public:
    struct Box {
        platform::String prompt;
        std::int32_t style = 0;
        platform::String title;
        friend bool operator==(const Box&, const Box&) = default;
    };

    void MsgBox(const platform::String& prompt, std::int32_t style,
                const platform::String& title) override {
        shown.push_back({prompt, style, title});
    }

    std::vector<Box> shown;
};

/// The box of an unexpected error.
inline RecordingBoxes::Box unexpectedError(platform::StringView module,
                                           platform::StringView function,
                                           platform::StringView number,
                                           platform::StringView description) {
    using platform::String;
    return {u"Module:\t" + String(module) + u"\r\nFunction:\t" + String(function) +
                u"\r\nError No:\t" + String(number) + u"\r\nError:\t" + String(description),
            48, u"Unexpected Error:"};
}
