// Operates the navigator and compares all callbacks, in order, with those expected.

#include <iostream>

#include "chapternavigator.h"
#include "testkit/fakeplatform.h"
#include "testkit/journal.h"
#include "testkit/recordinglistener.h"

int main()
{
    bdmvtest::Journal journal;
    bdmvtest::RecordingListener client(journal, "client");
    ChapterNavigator navigator;
    navigator.Listeners().AddListener(&client);

    navigator.Play();
    navigator.GoToChapter(3);
    navigator.SelectAudio(2);

    const std::string expected = "client.PlayStarted()\n"
                                 "client.ChapterNumber(3)\n"
                                 "client.AudioInfo(2)\n";
    const std::string received = journal.Take();
    if (received != expected) {
        std::cerr << "expected:\n" << expected << "received:\n" << received;
    }
    navigator.Listeners().RemoveListener(&client);
    return received == expected ? 0 : 1;
}
