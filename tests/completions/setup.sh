# Sourced by the transcripts of completions. QUARN_COMPLETIONS is the folder of what they try.
. "$TESTDIR/../cli/setup.sh"
export QUARN_COMPLETIONS

# Members and files of names that a shell must quote; one of them can't be listed as it is.
mkdir folder files
for name in 'one.o' 'two words.o' "it's.o" 'money$x.o' 'a;b&c|(d).o' '[x]*?.o' 'say "hi".o' '-dash.o' $'bell\a.o' 'key=1:2.o'; do
  printf '%s' "$name" > "files/$name"
done
library lib.a files/*
rm files/*
# Characters that one shell or another takes for its own.
for name in '~home.o' '#note.o' '!last.o' '=which.o' '{a,b}.o' $'tab\there.o' 'a:b.o' '^c.o' 'p%q.o'; do
  printf '%s' "$name" > "files/$name"
done
library odd.a files/*
cp lib.a 'folder/my lib.a'
rm -r files
echo 'no archive' > broken.a
mkfifo pipe.a
file new.o n
