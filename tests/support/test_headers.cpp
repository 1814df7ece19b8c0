// SPDX-License-Identifier: Apache-2.0
// A precompiled header belongs to a target, and a target needs a source.
