#pragma once

#include <Zandor/platform/Toolkit.h>

#include <vector>

/// Message boxes that nobody sees, for classes that need no more of a toolkit.
class RecordingBoxes : public zandor::platform::MessageBoxes {
public:
    struct Box {
        zandor::platform::String prompt;
        std::int32_t style = 0;
        zandor::platform::String title;
        friend bool operator==(const Box&, const Box&) = default;
    };

    void MsgBox(const zandor::platform::String& prompt, std::int32_t style,
                const zandor::platform::String& title) override {
        shown.push_back({prompt, style, title});
    }

    std::vector<Box> shown;
};

/// The box of an unexpected error.
inline RecordingBoxes::Box unexpectedError(zandor::platform::StringView module,
                                           zandor::platform::StringView function,
                                           zandor::platform::StringView number,
                                           zandor::platform::StringView description) {
    using zandor::platform::String;
    return {u"Module:\t" + String(module) + u"\r\nFunction:\t" + String(function) +
                u"\r\nError No:\t" + String(number) + u"\r\nError:\t" + String(description),
            48, u"Unexpected Error:"};
}
