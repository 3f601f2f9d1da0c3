#include "context.h"

namespace bench
{

bd::PlayListIdDef Context::GetPlayListId()
{
    return 800;
}

bd::PlayItemIdDef Context::GetPlayItemId()
{
    return 12;
}

bd::TimePosition Context::GetCurrentTimePosition()
{
    return Position;
}

void Context::GetVideoAttributes(bd::VideoFormatType& format, bd::VideoAspectRatioType& aspectRatio)
{
    format = bd::VideoFormatType1080p;
    aspectRatio = bd::VideoAspectRatioType16x9;
}

void Context::IsAsyncPipInCurrentPlayItem(bool& fg2ndVid, bool& fg2ndAud, bool& fgPrev2ndVid,
                                          bool& fgPrev2ndAud)
{
    fg2ndVid = fg2ndAud = fgPrev2ndVid = fgPrev2ndAud = false;
}

} // namespace bench
