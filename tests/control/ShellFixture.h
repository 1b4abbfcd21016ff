#pragma once

#include "support/Backstage.h"
#include "support/FakeModel.h"
#include "support/Stage.h"

#include <gtest/gtest.h>

/// A control on a stage, with its traces off and nothing recorded yet.
class AControl : public testing::Test {
protected:
    using String = zandor::platform::String;
    using StringView = zandor::platform::StringView;
    using Backstage = TalvikDBxZandor::ZandorBackstage;

    AControl() {
        zandor().DebugSwitch(0);
        forget();
    }

    TalvikDBxZandor::Zandor& zandor() { return stage->control(); }
    zandor::platform::Toolkit& toolkit() { return stage->toolkit(); }
    MSFlexGridLib::MSFlexGrid& grid() { return *Backstage::sprColumn(zandor()); }
    zandor::platform::Frame& canvas() { return *Backstage::fraTable(zandor()); }
    void bind(const zandor::platform::Ref<fake::Model>& model) { zandor().P_SET_Zandor(model); }
    Stage::Seen look(const std::string& name) { return stage->look(name); }

    void forget() {
        stage->boxes.clear();
        stage->raised.clear();
        stage->transcript.clear();
    }

    static Stage::Box trace(StringView text, StringView title = u"TalvikDBxZandor.Zandor") {
        return {String(text), String(title), 4096};
    }
    static Stage::Box unexpected(StringView function, StringView number, StringView description) {
        return {u"Module:\tTalvikDBxZandor.Zandor\r\nFunction:\t" + String(function) +
                    u"\r\nError No:\t" + String(number) + u"\r\nError:\t" + String(description),
                u"Unexpected Error:", 48};
    }
    static Stage::Box objectNotSet(StringView function) {
        return unexpected(function, u"91", u"Object variable or With block variable not set");
    }
    static Stage::Box invalidValue(StringView function) {
        return unexpected(function, u"380", u"Invalid property value");
    }

    fake::Library library;
    std::unique_ptr<Stage> stage = Stage::open(library);
};
