// The library with the example port: it links, and everything but the log works.
#include "bd/logging.h"
#include "bd/refptr.h"
#include "database/uomasktable.h"

namespace
{

struct Counted {
    virtual ~Counted() = default;
};

} // namespace

int main()
{
    bool evaluated = false;
    const bd::LogTag tag = {bd::CompIdTest, KEVRO_Log_LevelFatal, 0};
    BD_LOG(tag, "%d", evaluated = true);

    const bd::RefPtr<Counted> first(new Counted);
    const bd::RefPtr<Counted> second(first);
    const bool counted = first.GetCount() == 2;

    bdmv::UOMaskTable masks(1);
    const bool reported = masks.GetUOMaskTable() == 1ULL << 63;
    masks.Init(nullptr);
    const bool asserted = masks == bdmv::UOMaskTable();

    return !evaluated && counted && reported && asserted ? 0 : 1;
}
