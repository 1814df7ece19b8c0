The banner names the product, and the version number is one number.

  $ . "$TESTDIR/setup.sh"
  $ both quarn --vsn
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  status 0
  $ both quarn --version
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  status 0
  $ both quarn -V
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  status 0
  $ both quarn --version_number
  out: 1000001
  status 0

It is the tool's own name that the banner shows.

  $ (exec -a other quarn --vsn) | tail -1
  Tool: quarn [01000001]

The version number ends the run before anything else is looked at.

  $ both quarn --version_number -t missing.a
  out: 1000001
  status 0
  $ both quarn -h --version_number
  out: 1000001
  status 0
  $ both quarn --vsn --version_number
  out: 1000001
  status 0
  $ both quarn --version_number -d -t lib.a
  out: 1000001
  status 0

A bad option comes first all the same.

  $ both quarn --version_number --nonsense
  err: Fatal error: L3900U: Unrecognized option '--nonsense'.
  status 1
