#include "examples/languages/German.h"

#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>

#include <QMetaProperty>

#include <gtest/gtest.h>

#include <algorithm>

using namespace zandor;

TEST(TheExampleOfLanguages, HasEveryTextInAnother) {
    model::Library library;
    ZandorWidget widget(library);
    widget.setDebugSwitch(0);
    std::size_t texts = 0;
    const QMetaObject& meta = ZandorWidget::staticMetaObject;
    for (int n = meta.propertyOffset(); n < meta.propertyCount(); ++n) {
        const QMetaProperty property = meta.property(n);
        const std::string name = property.name();
        if (!name.starts_with("LNG") || property.metaType().id() != QMetaType::QString) continue;
        ++texts;
        const auto* const own = std::ranges::find(
            german::properties, name, [](const auto& each) { return std::string(each.first); });
        ASSERT_NE(own, std::end(german::properties)) << name;
        EXPECT_NE(QString::fromUtf8(own->second), property.read(&widget).toString()) << name;
        EXPECT_TRUE(widget.setProperty(own->first, QString::fromUtf8(own->second))) << name;
    }
    EXPECT_EQ(texts, std::size(german::properties));

    const platform::Words german = german::words(), english;
    for (const auto& [name, word] : platform::wordTable)
        EXPECT_NE(german.*word, english.*word) << platform::toUtf8(name);
}
