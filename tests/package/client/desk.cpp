// A program that plays the disc it is given.
#include "deskplayer/desk.h"
#include "deskplayer/session.h"

int main(int argc, char** argv)
{
    if (argc > 1) {
        deskplayer::Desk desk(argv[1]);
        deskplayer::PlayFromStartToEnd(desk);
    }
    return 0;
}
