#include "navigatorkit/eventqueue.h"

class alignas(2 * alignof(std::max_align_t)) Aligned : public bdmv::INavigatorEvent
{
public:
    void Dispatch(Listeners& /*listeners*/) override {}
};

/** Posts an event that needs a stricter alignment. */
void Post(bdmv::EventQueue& queue)
{
    queue.Post<Aligned>();
}
