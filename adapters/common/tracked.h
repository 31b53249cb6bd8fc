// What a call has made and not yet handed over: lists that are threaded through the objects.
#pragma once

#include <boost/intrusive/list.hpp>

namespace ambrix {

/// An object that may be on a list, which it leaves when it is destroyed.
struct Tracked
    : boost::intrusive::list_base_hook<boost::intrusive::link_mode<boost::intrusive::auto_unlink>> {
};

/// A list of objects that it does not own. Counting them takes time in proportion.
using TrackedList = boost::intrusive::list<Tracked, boost::intrusive::constant_time_size<false>>;

}  // namespace ambrix
