#include "navigatorkit/eventqueue.h"

/** Has everything but the base. */
class Unrelated
{
public:
    void Dispatch(bdmv::INavigatorEvent::Listeners& /*listeners*/) {}
};

/** Posts what is no event. */
void Post(bdmv::EventQueue& queue)
{
    queue.Post<Unrelated>();
}
