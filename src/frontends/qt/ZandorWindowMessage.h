#pragma once

#include <Zandor/qt/export.h>

#include <QEvent>
#include <QString>

#include <cstdint>

/// A window message by registered name, sent to a ZandorWidget. A host sees it with an event
/// filter on the widget or on the application:
///
///     if (event->type() == ZandorWindowMessage::typeOf("TALVIKDISABLEVELT"))
///         ... static_cast<ZandorWindowMessage*>(event)->wParam() ...
class ZANDOR_WIDGETS_EXPORT ZandorWindowMessage : public QEvent {
public:
    ZandorWindowMessage(Type type, std::uintptr_t wParam, std::int32_t* lParam)
        : QEvent(type), mWParam(wParam), mLParam(lParam) {}

    /// The event type of a name: the same for the same name in the whole process, QEvent::None
    /// when Qt has no type left.
    static Type typeOf(const QString& name);

    /// The name that the message's type was registered under.
    QString name() const;
    std::uintptr_t wParam() const { return mWParam; }
    /// May be nullptr; valid only while the event is delivered.
    std::int32_t* lParam() const { return mLParam; }

    ZandorWindowMessage* clone() const override { return new ZandorWindowMessage(*this); }

private:
    std::uintptr_t mWParam;
    std::int32_t* mLParam;
};
