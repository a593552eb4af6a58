#ifndef NSWEATHER_LISTENER_LIST_H
#define NSWEATHER_LISTENER_LIST_H

#include <algorithm>
#include <vector>

namespace NSWeather
{

// Listeners that may add or remove listeners while being called back.
// Notify walks a copy, so the walk never meets a changed vector, and
// calls only the listeners still registered when their turn comes, so a
// listener removed by an earlier one is never called.
template <typename Listener>
class ListenerList
{
public:
    // False when an equal listener is already registered.
    bool Add(const Listener& listener)
    {
        if (Contains(listener))
            return false;
        mListeners.push_back(listener);
        return true;
    }

    // False when no equal listener was registered.
    bool Remove(const Listener& listener)
    {
        auto it = std::find(mListeners.begin(), mListeners.end(), listener);
        if (it == mListeners.end())
            return false;
        mListeners.erase(it);
        return true;
    }

    bool Contains(const Listener& listener) const
    {
        return std::find(mListeners.begin(), mListeners.end(), listener) != mListeners.end();
    }

    bool IsEmpty() const { return mListeners.empty(); }
    void Clear() { mListeners.clear(); }

    template <typename Call>
    void Notify(Call&& call) const
    {
        const std::vector<Listener> snapshot = mListeners;
        for (const Listener& listener : snapshot)
            if (Contains(listener))
                call(listener);
    }

private:
    std::vector<Listener> mListeners;
};

}  // namespace NSWeather

#endif
