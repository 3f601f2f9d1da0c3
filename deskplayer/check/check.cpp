#include "check/check.h"

#include <optional>
#include <utility>
#include <vector>

#include "check/clips.h"
#include "check/playlistcheck.h"

namespace deskplayer
{

namespace
{

constexpr std::size_t NumberOfMovieObject = 6; ///< offset in an object of the index

class Check
{
public:
    Check(const Disc& disc, const FaultHandler& onFault,
          const std::function<void(const std::string&)>& onFile)
        : m_rDisc(disc), m_rOnFile(onFile), m_Report([this, &onFault](const Fault& fault) {
              ++m_Faults;
              onFault(fault);
          })
    {
    }

    std::size_t Run()
    {
        const auto index = Read("BDMV/index.bdmv", [this] { return m_rDisc.ReadIndex(); });
        const auto objects =
            Read("BDMV/MovieObject.bdmv", [this] { return m_rDisc.ReadMovieObjects(); });
        if (index && objects) {
            CheckIndex(*index, objects->objects.size());
        }

        Clips clips;
        for (const std::string& name :
             ReadNames("BDMV/CLIPINF", [this] { return m_rDisc.ClipNames(); })) {
            clips[name] = Read("BDMV/CLIPINF/" + name + ".clpi",
                               [&] { return ClipContents(m_rDisc.ReadClipInfo(name)); });
        }

        for (const std::uint32_t number :
             ReadNames("BDMV/PLAYLIST", [this] { return m_rDisc.PlayListNumbers(); })) {
            const std::string file =
                "BDMV/PLAYLIST/" + std::to_string(100000 + number).substr(1) + ".mpls";
            if (const auto playList = Read(file, [&] { return m_rDisc.ReadPlayList(number); })) {
                CheckPlayList(*playList, file, clips, m_Report);
            }
        }
        return m_Faults;
    }

private:
    /** @return nothing, after a report, if reading fails */
    template <typename ReadFile>
    auto Read(const std::string& file, const ReadFile& read) -> std::optional<decltype(read())>
    {
        if (m_rOnFile) {
            m_rOnFile(file);
        }
        try {
            return read();
        } catch (const FormatError& error) {
            m_Report({error.FileName(), error.Offset(), error.Found(), error.Expected()});
        } catch (const FileError& error) {
            m_Report({error.Path(), std::nullopt, error.Found(), error.Expected()});
        }
        return std::nullopt;
    }

    /** The files of a folder; none, after a report, if reading fails. */
    template <typename ReadFolder>
    auto ReadNames(const std::string& folder, const ReadFolder& read) -> decltype(read())
    {
        auto names = Read(folder, read);
        return names ? std::move(*names) : decltype(read())();
    }

    void CheckIndex(const Index& index, std::size_t movieObjects)
    {
        CheckIndexObject("first playback", index.firstPlayback, movieObjects);
        CheckIndexObject("top menu", index.topMenu, movieObjects);
        std::size_t number = 0;
        for (const IndexObject& title : index.titles) {
            CheckIndexObject("title " + std::to_string(++number), title, movieObjects);
        }
    }

    void CheckIndexObject(const std::string& name, const IndexObject& object,
                          std::size_t movieObjects)
    {
        if (object.objectType == ObjectTypeMovieObject && object.movieObject >= movieObjects) {
            m_Report({"BDMV/index.bdmv", object.offset + NumberOfMovieObject,
                      "movie object of " + name + " is " + std::to_string(object.movieObject),
                      "below " + std::to_string(movieObjects) +
                          ", the number of objects in MovieObject.bdmv"});
        }
    }

    const Disc& m_rDisc;
    const std::function<void(const std::string&)>& m_rOnFile;
    std::size_t m_Faults = 0;
    const FaultHandler m_Report;
};

} // namespace

std::size_t CheckDisc(const Disc& disc, const FaultHandler& onFault,
                      const std::function<void(const std::string&)>& onFile)
{
    return Check(disc, onFault, onFile).Run();
}

} // namespace deskplayer
