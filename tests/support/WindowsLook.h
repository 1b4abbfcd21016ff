#pragma once

#include "frontends/windows/toolkit/CanvasItems.h"
#include "frontends/windows/toolkit/Dialog.h"
#include "frontends/windows/toolkit/Inputs.h"
#include "frontends/windows/toolkit/PickList.h"
#include "frontends/windows/toolkit/ScrollBar.h"
#include "frontends/windows/toolkit/TableWindow.h"
#include "frontends/windows/toolkit/Text.h"
#include "support/Stage.h"

#include <Zandor/platform/Toolkit.h>

namespace hands {

namespace parts = zandor::platform::windows;

/// A part of a control by its name, of its dialogs first, shown or not.
inline parts::Window* findPart(const Stage::String& name, HWND surface) {
    struct Search {
        const Stage::String& name;
        parts::Window* found = nullptr;

        static BOOL CALLBACK test(HWND window, LPARAM l) {
            auto& search = *reinterpret_cast<Search*>(l);
            parts::Window* const part = parts::Window::of(window);
            if (part && part->isAlive() && part->name() == search.name) search.found = part;
            return !search.found;
        }
        static BOOL CALLBACK testDialog(HWND window, LPARAM l) {
            if (!dynamic_cast<parts::FormWindow*>(parts::Window::of(window))) return TRUE;
            return test(window, l) && EnumChildWindows(window, &test, l) &&
                   !reinterpret_cast<Search*>(l)->found;
        }
    } search{name};
    const LPARAM wanted = reinterpret_cast<LPARAM>(&search);
    EnumThreadWindows(GetCurrentThreadId(), &Search::testDialog, wanted);
    if (!search.found && surface) EnumChildWindows(surface, &Search::test, wanted);
    return search.found;
}

inline void lookAt(const parts::CanvasItem& item, Stage::Seen& seen) {
    seen.visible = item.visible();
    seen.enabled = true;
    if (const auto* const line = dynamic_cast<const parts::CanvasLine*>(&item)) {
        seen.X1 = line->X1();
        seen.Y1 = line->Y1();
        seen.X2 = line->X2();
        seen.Y2 = line->Y2();
        seen.borderWidth = line->borderWidth();
    } else if (const auto* const shape = dynamic_cast<const parts::CanvasShape*>(&item)) {
        seen.bounds = shape->bounds();
        seen.shape = shape->shapeStyle();
    }
}

/// What a user sees of a window of its kind: texts, items, values.
inline void lookAtKind(const parts::Window& window, Stage::Seen& seen) {
    if (const auto* const bar = dynamic_cast<const parts::ScrollBarWindow*>(&window)) {
        SCROLLINFO info{};
        info.cbSize = sizeof info;
        info.fMask = SIF_ALL;
        GetScrollInfo(bar->hwnd(), SB_CTL, &info);
        seen.value = static_cast<std::int16_t>(info.nPos);
        seen.largeChange = static_cast<std::int16_t>(info.nPage);
        seen.max = static_cast<std::int16_t>(info.nMax - static_cast<int>(info.nPage) + 1);
    } else if (const auto* const list = dynamic_cast<const parts::ChoiceWindow*>(&window)) {
        seen.listIndex = static_cast<std::int16_t>(list->chosen());
        if (seen.listIndex >= 0) seen.text = list->item(seen.listIndex);
        seen.dropped = list->isDropped();
        for (int i = 0; i < list->count(); ++i) seen.items.push_back(list->item(i));
    } else if (const auto* const pick = dynamic_cast<const parts::PickWindow*>(&window)) {
        seen.text = pick->typed();
        seen.items = pick->left();
    } else if (const auto* const table = dynamic_cast<const parts::TableWindow*>(&window)) {
        seen.text = table->title();
        const parts::EntryList& entries = table->list();
        for (int row = 0; row < entries.count(); ++row) {
            seen.items.push_back(entries.textOf(row));
            const parts::EntryLook look = entries.lookOf(row);
            if (look.comesOut) seen.output.push_back(seen.items.back());
            if (look.picture == zandor::platform::Picture::key)
                seen.keys.push_back(seen.items.back());
            if (entries.isSelected(row)) seen.selected.push_back(seen.items.back());
        }
    } else {
        seen.text = parts::textOf(window.hwnd());
    }
}

/// Text, title and style of a message box of the system's, as they stand on the screen.
inline Stage::Box readBox(HWND box) {
    Stage::Box seen;
    seen.title = parts::textOf(box);
    for (HWND part = nullptr; (part = FindWindowExW(box, part, L"Static", nullptr));) {
        if ((GetWindowLongW(part, GWL_STYLE) & SS_TYPEMASK) == SS_ICON) {
            if (SendMessageW(part, STM_GETICON, 0, 0))
                seen.style += zandor::platform::styleExclamation;
        } else {
            seen.text = parts::textOf(part);
        }
    }
    if (GetWindowLongW(box, GWL_EXSTYLE) & WS_EX_TOPMOST)
        seen.style += zandor::platform::styleSystemModal;
    return seen;
}

} // namespace hands
