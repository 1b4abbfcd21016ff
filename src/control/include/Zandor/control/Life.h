#pragma once

#include <Zandor/platform/Toolkit.h>
#include <Zandor/platform/export.h>

#include <memory>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// Thrown where a procedure finds gone what it works for: its control, or what it was told to work
/// on. It is no failure: `basZandor::Guard` ends the procedure in quiet, and its caller goes on
/// until it finds the same.
struct Gone {};

/// Ends the procedure at hand in quiet unless what it works for is still there.
inline void require(bool stillThere) {
    if (!stillThere) [[unlikely]]
        throw Gone{};
}

/// How long a control is there. A host may do anything while its code runs, which is in every
/// message box, dialog, menu and drag, in every event, and in every call of its model: bind another
/// model, close tables, destroy the control. For whoever writes a procedure this means:
///
/// - Its body runs in a Guard. Toolkit, library, model and constituents are reached through the
///   members of the control, events through `Raise`: each of them ends the procedure in quiet
///   (`Gone`) once the control has ended.
/// - What it goes on to use after such a place it holds: text and numbers as copies, objects as
///   `Held`, which checks the same at each use. It keeps no iterator, reference or index into a
///   collection of the control across it.
/// - Before it acts on the drawing again it asks whether that is still what it was: `Shows` for a
///   table list, `Draws` for a join, `mBinding` for a binding, ColData for a grid column.
/// - One expression calls the model once: between two calls there must be a check.
/// - No `catch (...)` of its own: `quietly` is for what may fail in silence.
class ZANDOR_CONTROL_EXPORT Life final : public platform::MessageBoxes {
public:
    /// `keeper` holds all that the control needs; each procedure keeps it until it has returned.
    Life(platform::MessageBoxes& boxes, std::weak_ptr<void> keeper)
        : mBoxes(boxes), mKeeper(std::move(keeper)) {}

    bool ended() const { return mEnded; }
    void end() { mEnded = true; }
    void check() const { require(!mEnded); }

    /// Whether a procedure runs.
    bool busy() const { return mRunning > 0; }

    /// A box of a control that has ended is not shown.
    void MsgBox(const platform::String& prompt, std::int32_t style,
                const platform::String& title) override {
        check();
        mBoxes.MsgBox(prompt, style, title);
    }

    /// Stands on the stack of a procedure for as long as it runs.
    class Procedure {
    public:
        explicit Procedure(Life& life) : mLife(life) {
            if (life.mRunning++ == 0) mKept = life.mKeeper.lock();
        }
        Procedure(const Procedure&) = delete;
        Procedure& operator=(const Procedure&) = delete;
        // The keeper goes last, and may take the control with it.
        ~Procedure() { --mLife.mRunning; }

    private:
        std::shared_ptr<void> mKept;
        Life& mLife;
    };

private:
    platform::MessageBoxes& mBoxes;
    const std::weak_ptr<void> mKeeper;
    int mRunning = 0;
    bool mEnded = false;
};

/// Runs what may fail in silence.
template <class Body>
void quietly(Body&& body) {
    try {
        body();
    } catch (const Gone&) {
        throw;
    } catch (...) {
        // The caller says why nobody needs to know.
    }
}

} // namespace TalvikDBxZandor
