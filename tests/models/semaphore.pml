/* The life of one named semaphore on POSIX: processes that open it, take and give back its unit, close it, and are
 * killed before any step; checked over every order of their steps.
 *
 * Step of the model                  function of the code
 * lockOpening                        OpeningLock::tryOnce: semget, semtimedop, then is the set still that of the key
 * releaseOpening                     OpeningLock::letGo
 * attach, count the attachments      Attachment::attach: shmat, then shmctl(IPC_STAT); search() and settle()
 * make a segment                     Attachment::make, in settle()
 * set its content                    Attachment::set, in settle(): several stores, here two
 * the unit                           take() and release(): one compare-and-swap each
 * detach                             close(): Attachment::detach
 * tidy up                            tidyUp(): Attachment::removeIfIdle, OpeningLock::remove
 * die                                the kernel's end of a process: memory is detached first, then the lock is undone
 *
 * A process that stands still in the lock needs no step of its own: others wait in the model for as long as it takes,
 * or give up as they do in the code when the bound has passed.
 *
 * What is checked:
 *   at most one holder               assert in enter
 *   no lost unit                     assert in open: a living count is the unit less its holder, dead or alive
 *   gone with the last handle        assert in open: who is alone gets a whole unit; at the end nothing is left of it
 *                                    but what only a killed process can leave, and the next opener uses it
 *   nobody blocked for ever          no invalid end state: each process comes to its end or is killed
 *
 * WITHOUT_WAITING and WITHOUT_COUNTING are faults put in on purpose, which the checks must find.
 *
 * Two identifiers of segments and two of sets are enough: a removed one may come back under the other identifier while
 * somebody still knows the former. LEAVES, if defined, is a closer of another user, who may not remove anything.
 */

/* The run of the tests defines these; larger ones take longer and have been run by hand. */
#ifndef PROCESSES
#define PROCESSES 3
#define ROUNDS 1
#define CRASHES 2
#endif
#define NONE 2 /* an identifier that is none; 0 is one */

/* The sets: the opening lock. */
byte setOfKey = NONE; /* what the key names now */
bool setLives[2];
byte setHolder[2]; /* process number + 1; 0 for free */

/* The segments. */
byte segmentOfKey = NONE;
bool segmentLives[2];
byte attached[2];  /* the kernel's count */
bool nameSet[2];
byte units[2];
byte deadHolders[2]; /* units that died with their process while the semaphore lived on */

byte holders; /* of the port, by the living */
byte crashes;

inline giveUpSegment(s) {
    attached[s]--;
    if
    :: attached[s] == 0 -> deadHolders[s] = 0
    :: else
    fi
}

/* The kernel's end of process me: it may be asked for before each step. */
inline die() {
    atomic {
        crashes++;
        if
        :: mine != NONE && holding -> deadHolders[mine]++; holders--; holding = false
        :: else
        fi;
        if
        :: mine != NONE -> giveUpSegment(mine); mine = NONE
        :: else
        fi
    }
    atomic {
        if
        :: lock != NONE && setLives[lock] && setHolder[lock] == me + 1 -> setHolder[lock] = 0
        :: else
        fi;
        goto dead
    }
}

inline mayDie() {
    if
    :: true
    :: crashes < CRASHES -> die()
    fi
}

/* Ends with lock != NONE where it is held. */
inline lockOpening(mayMake) {
    do
    :: atomic { /* semget */
           lock = setOfKey;
           if
           :: lock == NONE && mayMake ->
              if
              :: !setLives[0] -> lock = 0
              :: else -> lock = 1
              fi;
              assert(!setLives[lock]);
              setLives[lock] = true;
              setHolder[lock] = 0;
              setOfKey = lock
           :: else
           fi
       }
       if
       :: lock == NONE -> break
       :: else
       fi;
       mayDie();
       atomic { /* semtimedop: wait until it is free or removed, then hold it in the same call */
#ifndef WITHOUT_WAITING
           (!setLives[lock] || setHolder[lock] == 0);
#endif
           if
           :: !setLives[lock] -> gone = true
           :: else -> setHolder[lock] = me + 1; gone = false
           fi
       }
       if
       :: gone -> skip /* once more */
       :: else ->
          mayDie();
          if /* semctl(IPC_STAT) */
          :: setOfKey == lock -> break
          :: else -> releaseOpening()
          fi
       fi
    od
}

inline releaseOpening() {
    atomic {
        if
        :: setLives[lock] && setHolder[lock] == me + 1 -> setHolder[lock] = 0
        :: else
        fi;
        lock = NONE
    }
}

proctype User(byte me) {
    byte lock = NONE;
    byte mine = NONE; /* the segment that this process is attached to */
    byte rounds = 0;
    bool gone = false;
    bool alone = false;
    bool holding = false;
    byte former = NONE;

    do
    :: rounds == ROUNDS -> break
    :: else ->
       rounds++;

       /* Open. */
       mayDie();
       lockOpening(true);
       mayDie();
       atomic { /* shmget: the key's segment, or a new one */
           former = segmentOfKey;
           if
           :: former == NONE ->
              if
              :: !segmentLives[0] -> former = 0
              :: else -> former = 1
              fi;
              assert(!segmentLives[former]);
              segmentLives[former] = true;
              attached[former] = 0;
              nameSet[former] = false;
              units[former] = 0;
              segmentOfKey = former
           :: else
           fi
       }
       mayDie();
       atomic { /* shmat */
           assert(segmentLives[former]);
           mine = former;
           attached[mine]++
       }
       mayDie();
#ifdef WITHOUT_COUNTING
       alone = !nameSet[mine]; /* the content believed */
#else
       alone = attached[mine] == 1; /* shmctl(IPC_STAT) */
#endif
       mayDie();
       if
       :: alone ->
          nameSet[mine] = false;
          mayDie();
          atomic { units[mine] = 1; deadHolders[mine] = 0 }
          mayDie();
          nameSet[mine] = true
       :: else -> assert(nameSet[mine])
       fi;
       assert(!alone || (attached[mine] == 1 && units[mine] == 1 && holders == 0));
       assert(segmentOfKey == mine && segmentLives[mine]);
       mayDie();
       releaseOpening();

       /* Take the unit if it is there, and give it back. */
       mayDie();
       atomic {
           if
           :: units[mine] > 0 ->
              units[mine]--;
              holding = true;
              holders++;
              assert(holders == 1)
           :: else
           fi;
           assert(units[mine] + holders + deadHolders[mine] == 1)
       }
       mayDie();
       atomic {
           if
           :: holding -> units[mine]++; holding = false; holders--; assert(units[mine] <= 1)
           :: else
           fi
       }

       /* Close. */
       mayDie();
       atomic {
           former = mine;
           giveUpSegment(mine);
           mine = NONE
       }
       mayDie();
       lockOpening(false);
       if
       :: lock != NONE ->
          mayDie();
          if
          :: segmentOfKey == former && segmentLives[former] && attached[former] == 0 ->
             mayDie();
#ifdef LEAVES
             if
             :: me == 0 -> skip
             :: else ->
#endif
             atomic {
                 assert(attached[former] == 0); /* nobody came while we looked */
                 segmentLives[former] = false;
                 segmentOfKey = NONE
             }
#ifdef LEAVES
             fi
#endif
          :: else
          fi;
          mayDie();
          if
          :: segmentOfKey == NONE ->
             mayDie();
             atomic { /* removes the set and lets go at once */
                 setLives[lock] = false;
                 setOfKey = NONE;
                 lock = NONE
             }
          :: else -> releaseOpening()
          fi
       :: else
       fi;
       atomic { former = NONE; alone = false; gone = false }
    od;
dead:
    atomic { former = NONE; alone = false; gone = false; rounds = 0; lock = NONE }
}

init {
    byte p = 0;
    atomic {
        do
        :: p < PROCESSES -> run User(p); p++
        :: else -> break
        od
    }
    _nr_pr == 1;
    assert(setOfKey == NONE || setHolder[setOfKey] == 0);
    assert(segmentOfKey == NONE || attached[segmentOfKey] == 0);
    assert(holders == 0);
#ifndef LEAVES
    assert(crashes > 0 || (segmentOfKey == NONE && setOfKey == NONE));
#endif
}
