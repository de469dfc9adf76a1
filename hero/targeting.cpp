#include "hero/targeting.h"

#include "shell/game.h"
#include "shell/timer_numbers.h"

namespace kr {

void ShowBoardPointer(Game& g)
{
    ui::Timer& blink = g.timers[kTargetBlinkTimer];
    if (g.GrenadePending) {
        blink.SetEnabled(false);
        g.form.pointer = ui::CursorPicture(ui::GrenadeCursor);
    } else if (g.BlastPending || g.TeleportPending) {
        const bool blinking = g.form.pointer == ui::CursorPicture(ui::TargetCursorA) ||
                              g.form.pointer == ui::CursorPicture(ui::TargetCursorB);
        if (!blinking) g.form.pointer = ui::CursorPicture(ui::TargetCursorA);
        blink.SetEnabled(true);
    } else {
        blink.SetEnabled(false);
        g.form.pointer = ui::CursorPicture(ui::NormalCursor);
    }
}

void ClearTargeting(Game& g)
{
    g.TeleportPending = false;
    g.BlastPending = false;
    g.GrenadePending = false;
    ShowBoardPointer(g);
}

void TargetBlinkTick(Game& g)
{
    if (g.form.pointer == ui::CursorPicture(ui::TargetCursorA))
        g.form.pointer = ui::CursorPicture(ui::TargetCursorB);
    else if (g.form.pointer == ui::CursorPicture(ui::TargetCursorB))
        g.form.pointer = ui::CursorPicture(ui::TargetCursorA);
}

}  // namespace kr
