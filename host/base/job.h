#pragma once

#include <cstddef>

// A job that may take long tells how far it has come, for whoever watches. Nobody does unless a
// program wants it; then a step costs a count, and the watcher is told of some of the steps.
//
//   Job const job(localText(L"Saving"), entities.size());
//   for (Entity const& each : entities) {
//       Job::step();
//       write(each);
//   }
//
// What a job calls steps on its behalf. A part of a job that knows how many steps it has is a job
// of its own, for as long as it lives.
namespace tzhost {

// Receives how far jobs have come. Throws for want of memory alone.
class JobWatcher {
public:
    virtual ~JobWatcher() = default;
    // A job begins that is no part of another.
    virtual void began() = 0;
    // `total` is 0 when nobody knows it.
    virtual void reached(wchar_t const* job, std::size_t done, std::size_t total) = 0;
    virtual void ended() noexcept = 0;
};

// Not owned; the watcher before. Null for none. It changes between jobs.
JobWatcher* setJobWatcher(JobWatcher* watcher) noexcept;

class Job {
public:
    // The name is in the user's language and lives as long as the job. A part of another job may go
    // without.
    explicit Job(wchar_t const* name, std::size_t total = 0);
    Job(Job const&) = delete;
    Job& operator=(Job const&) = delete;
    ~Job();

    // One more step of the innermost job, if there is one.
    static void step();

private:
    void tell() const;

    Job* outer_;
    wchar_t const* name_;
    std::size_t total_;
    std::size_t done_ = 0;
};

}  // namespace tzhost
