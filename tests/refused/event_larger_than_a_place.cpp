#include "navigatorkit/eventqueue.h"

class Large : public bdmv::INavigatorEvent
{
public:
    void Dispatch(Listeners& /*listeners*/) override {}

    unsigned char bytes[bdmv::EventQueue::LargestEvent - sizeof(void*) + 1];
};

/** Posts an event that is a byte too large. */
void Post(bdmv::EventQueue& queue)
{
    queue.Post<Large>();
}
