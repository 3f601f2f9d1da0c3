# Doxygen reads the callbacks as values through this: it documents what all of them have. Lines are
# extended, never added, so that the numbers in warnings are those of the header.
s/^    static constexpr CallbackId Id\(\)/    \/** The number of the callback. *\/ &/
s/^    void CallOn\(/    \/** Calls the callback on @p listener. *\/ &/
s/^    template <typename Self, typename Visitor>/    \/** See Callback::VisitArguments(). *\/ &/
s/^    [A-Za-z0-9_:]+( [a-z]+\*)? [a-zA-Z]+;$/& \/\/\/< the argument of that name/
