# Boost before 1.81 hashes on top of a class that C++17 removed; libc++ gives it back on request. Only tests include that.
set(ZON_LIBCXX_FOR_OLDER_BOOST -D_LIBCPP_ENABLE_CXX17_REMOVED_UNARY_BINARY_FUNCTION)
