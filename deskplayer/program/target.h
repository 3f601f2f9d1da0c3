/**
 * @file
 * Where the program writes.
 */
#ifndef DESKPLAYER_PROGRAM_TARGET_H
#define DESKPLAYER_PROGRAM_TARGET_H

#include <array>
#include <cstddef>
#include <ostream>
#include <streambuf>
#include <string>

namespace deskplayer
{

/** Writes to a file descriptor, and keeps the system's reason when that fails. */
class DescriptorBuffer : public std::streambuf
{
public:
    DescriptorBuffer();

    DescriptorBuffer(const DescriptorBuffer&) = delete;
    DescriptorBuffer& operator=(const DescriptorBuffer&) = delete;

    /** @param descriptor is still owned by the caller */
    void Attach(int descriptor) { m_Descriptor = descriptor; }

    /** The error number of the first write that failed; 0 if none did. */
    int Error() const { return m_Error; }

protected:
    int_type overflow(int_type character) override;
    int sync() override;

private:
    bool WriteAll();

    std::array<char, std::size_t{64} * 1024> m_Buffer;
    int m_Descriptor = -1;
    int m_Error = 0;
};

/** The output: a file, or standard output. */
class Target
{
public:
    /** @param fileName empty for standard output */
    explicit Target(std::string fileName);
    ~Target();

    Target(const Target&) = delete;
    Target& operator=(const Target&) = delete;

    /**
     * Discards the contents of an existing file, so call this only after reading all input.
     *
     * @throw OutputError the file cannot be written
     */
    std::ostream& Open();

    /** Flushes the output. @throw OutputError something could not be written */
    void Finish();

private:
    [[noreturn]] void Fail(int error) const;

    const std::string m_FileName;
    int m_File = -1; ///< the file that this object opened, if any
    DescriptorBuffer m_Buffer;
    std::ostream m_Stream;
};

} // namespace deskplayer

#endif
