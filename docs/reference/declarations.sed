# Doxygen reads every header through this. It empties declarations that say nothing new: a class can
# be copied unless its page says otherwise, and every event overrides Dispatch(). No line is added,
# so that the numbers in warnings are those of the header.
s/^ +[A-Za-z]+\(const [A-Za-z]+&\) = default;$//
s/^ +[A-Za-z]+& operator=\(const [A-Za-z]+&\) = default;$//
s/^ +void Dispatch\(Listeners& listeners\) override;$//
