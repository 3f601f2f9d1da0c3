/**
 * @file
 * A listener interface with every kind of method, and a listener that records its calls.
 */
#ifndef TESTS_BD_PROBE_H
#define TESTS_BD_PROBE_H

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "testkit/describe.h"
#include "testkit/journal.h"

namespace bdmvtest
{

/** A number that counts how often it is copied. */
struct CountedValue {
    explicit CountedValue(int theNumber) : number(theNumber) {}
    CountedValue(const CountedValue& other) : number(other.number) { ++copies; }
    CountedValue& operator=(const CountedValue&) = delete;
    ~CountedValue() = default;

    int number;
    static inline int copies = 0;
};

/** Takes values, counted values, and references, one to four of each. */
class IProbe
{
public:
    IProbe() = default;
    virtual ~IProbe() = default;
    IProbe(const IProbe&) = delete;
    IProbe& operator=(const IProbe&) = delete;

    virtual void Call0() = 0;
    virtual void Call1(int a) = 0;
    virtual void Call2(int a, int b) = 0;
    virtual void Call3(int a, int b, int c) = 0;
    virtual void Call4(int a, int b, int c, int d) = 0;

    virtual void Copy1(CountedValue a) = 0;
    virtual void Copy2(CountedValue a, CountedValue b) = 0;
    virtual void Copy3(CountedValue a, CountedValue b, CountedValue c) = 0;
    virtual void Copy4(CountedValue a, CountedValue b, CountedValue c, CountedValue d) = 0;
    virtual void CopyConst(const CountedValue a) = 0;

    virtual void Refer1(int& a) = 0;
    virtual void Refer2(int& a, const int& b) = 0;
    virtual void Refer3(int& a, const int& b, int& c) = 0;
    virtual void Refer4(int& a, const int& b, int& c, const int& d) = 0;
};

/** Writes its calls into the journal: its name, the method, and the arguments. */
class Probe : public IProbe
{
public:
    Probe(Journal& journal, std::string name) : m_rJournal(journal), m_Name(std::move(name)) {}

    /** Called after a call has been recorded. */
    std::function<void()> onCall;

    /** The methods with one parameter add it to their argument, if they can change that. */
    int increment = 0;

    /** What the references of the last call refer to. */
    std::vector<const int*> referents;

    void Call0() override { Record("Call0"); }

    void Call1(int a) override
    {
        Record("Call1", a);
        a += increment;
    }

    void Call2(int a, int b) override { Record("Call2", a, b); }
    void Call3(int a, int b, int c) override { Record("Call3", a, b, c); }
    void Call4(int a, int b, int c, int d) override { Record("Call4", a, b, c, d); }

    void Copy1(CountedValue a) override
    {
        Record("Copy1", a.number);
        a.number += increment;
    }

    void Copy2(CountedValue a, CountedValue b) override { Record("Copy2", a.number, b.number); }

    void Copy3(CountedValue a, CountedValue b, CountedValue c) override
    {
        Record("Copy3", a.number, b.number, c.number);
    }

    void Copy4(CountedValue a, CountedValue b, CountedValue c, CountedValue d) override
    {
        Record("Copy4", a.number, b.number, c.number, d.number);
    }

    void CopyConst(const CountedValue a) override { Record("CopyConst", a.number); }

    void Refer1(int& a) override
    {
        referents = {&a};
        Record("Refer1", a);
        a += increment;
    }

    void Refer2(int& a, const int& b) override
    {
        referents = {&a, &b};
        Record("Refer2", a, b);
    }

    void Refer3(int& a, const int& b, int& c) override
    {
        referents = {&a, &b, &c};
        Record("Refer3", a, b, c);
    }

    void Refer4(int& a, const int& b, int& c, const int& d) override
    {
        referents = {&a, &b, &c, &d};
        Record("Refer4", a, b, c, d);
    }

private:
    template <typename... Arguments> void Record(const std::string& method, Arguments... arguments)
    {
        m_rJournal.Add(m_Name + "." + DescribeCall(method, arguments...));
        if (onCall) {
            onCall();
        }
    }

    Journal& m_rJournal;
    std::string m_Name;
};

} // namespace bdmvtest

#endif
