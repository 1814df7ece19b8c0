// SPDX-License-Identifier: Apache-2.0
//
// A precompiled header belongs to a target, and a target needs a source. The tests share one header
// of the test library in this way, which is a large part of what compiling each of them would cost.
