#include "forms/evaluation_order.h"

#include <algorithm>
#include <queue>

namespace mirel {
namespace {

class Sorter {
public:
    explicit Sorter(const ControlReferences& references)
        : references_(references)
        , waitsFor_(references.size())
        , readers_(references.size())
        , isDone_(references.size())
    {
        for (size_t control = 0; control < references.size(); ++control) {
            for (const int read : references[control]) {
                if (!IsListed(read))
                    continue;
                readers_[size_t(read)].push_back(int(control));
                ++waitsFor_[control];
            }
            if (waitsFor_[control] == 0)
                ready_.push(int(control));
        }
    }

    std::vector<int> Order()
    {
        size_t firstOpen = 0;
        while (order_.size() < references_.size()) {
            if (!ready_.empty()) {
                const int next = ready_.top();
                ready_.pop();
                Take(next);
                continue;
            }
            while (isDone_[firstOpen])
                ++firstOpen;
            Take(FirstOfCircle(int(firstOpen)));
        }
        return order_;
    }

private:
    bool IsListed(int control) const { return control >= 0 && size_t(control) < references_.size(); }

    void Take(int control)
    {
        if (isDone_[size_t(control)])
            return;
        isDone_[size_t(control)] = true;
        order_.push_back(control);
        for (const int reader : readers_[size_t(control)]) {
            if (--waitsFor_[size_t(reader)] == 0)
                ready_.push(reader);
        }
    }

    // Nothing is ready, so following what is waited for from anywhere ends in a circle.
    int FirstOfCircle(int control) const
    {
        std::vector<int> path;
        std::vector<bool> isOnPath(references_.size());
        while (!isOnPath[size_t(control)]) {
            isOnPath[size_t(control)] = true;
            path.push_back(control);
            const std::vector<int>& reads = references_[size_t(control)];
            control =
                *std::ranges::find_if(reads, [&](int read) { return IsListed(read) && !isDone_[size_t(read)]; });
        }
        return *std::min_element(std::ranges::find(path, control), path.end());
    }

    const ControlReferences& references_;
    std::vector<int> waitsFor_; // how many of its references are still to be computed
    std::vector<std::vector<int>> readers_;
    std::vector<bool> isDone_;
    std::priority_queue<int, std::vector<int>, std::greater<>> ready_; // as listed
    std::vector<int> order_;
};

} // namespace

std::vector<int> EvaluationOrder(const ControlReferences& references)
{
    return Sorter(references).Order();
}

} // namespace mirel
