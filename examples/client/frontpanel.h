/**
 * @file
 * A front panel that shows the state of playback in one word.
 */
#ifndef EXAMPLES_CLIENT_FRONTPANEL_H
#define EXAMPLES_CLIENT_FRONTPANEL_H

#include <atomic>

#include "bdmvnavigator/navigatorlisteneradapter.h"

/** Register it as a listener. The panel's own thread reads what to show. */
class FrontPanel : public bdmv::NavigatorListenerAdapter
{
public:
    /** Any thread. */
    const char* Text() const { return m_Text; }

    void PlayStarted() override { m_Text = "PLAY"; }
    void Paused() override { m_Text = "PAUSE"; }
    void Continued(bd::PlayDirectionDef, bd::PlaySpeedDef) override { m_Text = "PLAY"; }
    void StillOn() override { m_Text = "STILL"; }

    void StillOff() override
    {
        if (!SEED_BUG) {
            m_Text = "PLAY";
        }
    }

    void Stopped() override { m_Text = "STOP"; }
    void Finished(FinishedReason) override { m_Text = "STOP"; }
    void PlayFailed() override { m_Text = "STOP"; }

private:
    std::atomic<const char*> m_Text{"STOP"};
};

#endif
