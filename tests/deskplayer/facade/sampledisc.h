/**
 * @file
 * The disc of the examples.
 */
#ifndef TESTS_DESKPLAYER_FACADE_SAMPLEDISC_H
#define TESTS_DESKPLAYER_FACADE_SAMPLEDISC_H

namespace bdmvtest
{

constexpr const char* SampleDisc = BDMVNAVIGATOR_SAMPLE_DISC;

} // namespace bdmvtest

#endif
