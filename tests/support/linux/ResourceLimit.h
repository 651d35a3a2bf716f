#pragma once

#include <gtest/gtest.h>
#include <sys/resource.h>

/// Limits what this process, and those that it starts, may use, for the length of an object's life.
class ResourceLimit {
public:
    ResourceLimit(__rlimit_resource resource, rlim_t most) : m_resource(resource) {
        getrlimit(resource, &m_before);
        const rlimit limit{most, m_before.rlim_max};
        EXPECT_EQ(0, setrlimit(resource, &limit));
    }
    ~ResourceLimit() { setrlimit(m_resource, &m_before); }
    ResourceLimit(const ResourceLimit&) = delete;
    ResourceLimit& operator=(const ResourceLimit&) = delete;

private:
    __rlimit_resource m_resource;
    rlimit m_before{};
};
