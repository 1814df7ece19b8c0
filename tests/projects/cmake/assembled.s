# SPDX-License-Identifier: Apache-2.0
# The one member of a library in assembler, for any machine.
	.globl assembled
	.data
assembled:
	.byte 1
