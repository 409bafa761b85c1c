/* The protocol of src/core/layer.cpp and layer_walk.cpp: walks without a lock, and removals that wait for
 * the calls of handlers on other threads. check.py looks at every interleaving of a scenario, as it stands
 * and with each of the mistakes that it must find.
 *
 * Widgets and blocks are small numbers from 1; 0 is the null pointer. A record belongs to the thread of its
 * number. Every step of a thread that others can see is a step of its own here: the code's atomics are
 * sequentially consistent, but for the stores that end a walk. A wait for a changed turn (std::atomic::wait) is a step that is possible once the
 * turn has changed.
 */

#ifndef WALKERS
#define WALKERS 2
#endif
#ifndef WALKS
#define WALKS 2 /* of each walker */
#endif

#define THREADS (WALKERS + 2)
#define REMOVER WALKERS /* the threads that walk nowhere */
#define APPENDER (WALKERS + 1)
#define WIDGETS (WALKERS + 1) /* that of the highest number stays */
#define BLOCKS 3
#define CAPACITY (WIDGETS + 1) /* one comes later */
#define NOBODY 99

/* widgets */
bool freed[WIDGETS + 1];
bool claimed[WIDGETS + 1]; /* a handler has begun to delete it */
bool answered;             /* the widget that got the address of another has come and gone */

/* blocks of a layer: places that are filled from the front */
typedef Block {
  byte place[CAPACITY];
  byte used;
  byte older;
  bool freed;
};
Block block[BLOCKS + 1];
byte current = 1;
byte lastBlock = 1;
bool layerLock;

/* records of walks */
typedef Record {
  byte pinned;
  byte thread = NOBODY;
  byte calling;
  byte waiting;
  byte turn;
};
Record record[WALKERS];

/* waits: one a thread */
typedef Wait {
  bool begun;
  byte record;
  byte turn;
  byte thread;
};
Wait wait[THREADS];
bool waitsLock;

inline acquire(mutex) { atomic { !mutex -> mutex = true } }
inline release(mutex) { mutex = false }

/* WalkRecord::nextTurn */
inline nextTurn(r, w) {
#ifdef MISTAKE_WAITING_READ_FIRST
  if
  :: record[r].waiting == 0 -> record[r].calling = w
  :: else -> record[r].calling = w; record[r].turn++
  fi
#else
  record[r].calling = w;
  if
  :: record[r].waiting == 0
#ifdef MISTAKE_TURN_NOT_COUNTED
  :: else
#else
  :: else -> record[r].turn++
#endif
  fi
#endif
}

/* isBehind: whether the thread that `me` would wait for waits, by others too, for `me` */
inline closesCircle(me, other, found) {
  found = false;
  at = other;
  do
  :: !wait[at].begun || record[wait[at].record].turn != wait[at].turn -> break
  :: else ->
     if
     :: wait[at].thread == me -> found = true; break
     :: else -> at = wait[at].thread
     fi
  od
}

inline waitForEnd(me, r, t, other) {
  acquire(waitsLock);
  closesCircle(me, other, circle);
#ifdef MISTAKE_CIRCLES_WAIT
  circle = false;
#endif
  if
  :: circle -> release(waitsLock)
  :: else ->
     wait[me].record = r;
     wait[me].turn = t;
     wait[me].thread = other;
     wait[me].begun = true;
     release(waitsLock);
     record[r].turn != t;
     acquire(waitsLock);
     wait[me].begun = false;
     release(waitsLock)
  fi
}

inline waitForCall(me, r, w) {
  if
  :: record[r].calling == w && record[r].thread != me ->
     record[r].waiting++;
     seenTurn = record[r].turn;
     if
#ifdef MISTAKE_NOT_LOOKED_AGAIN
     :: true ->
#else
     :: record[r].calling == w && record[r].thread != me ->
#endif
        seenThread = record[r].thread;
        if
        :: record[r].turn != seenTurn
        :: else -> waitForEnd(me, r, seenTurn, seenThread)
        fi
     :: else
     fi;
     record[r].waiting--
  :: else
  fi
}

inline waitUntilNotCalled(me, w) {
  r = 0;
  do
  :: r < WALKERS -> waitForCall(me, r, w); r++
  :: else -> break
  od
}

/* Layer::clear over the chain of blocks; the lock is held */
inline clearPlaces(w) {
  b = current;
  do
  :: b == 0 -> break
  :: else ->
     i = 0;
     do
     :: i == block[b].used -> break
     :: block[b].place[i] == w && i < block[b].used -> block[b].place[i] = 0; break
     :: else -> i++
     od;
#ifdef MISTAKE_OLDER_BLOCKS_FORGOTTEN
     break
#else
     b = block[b].older
#endif
  od
}

/* LayerWalk::forget */
inline forget(w) {
#ifndef MISTAKE_NOT_FORGOTTEN
  r = 0;
  do
  :: r < WALKERS ->
     atomic {
       if
       :: record[r].calling == w -> record[r].calling = 0
       :: else
       fi
     };
     r++
  :: else -> break
  od
#else
  skip
#endif
}

/* Layers::leave and the destructor's end */
inline deleteWidget(me, w) {
#ifdef MISTAKE_WAIT_BEFORE_CLEARING
  waitUntilNotCalled(me, w);
#endif
  acquire(layerLock);
  clearPlaces(w);
  release(layerLock);
#ifndef MISTAKE_WAIT_BEFORE_CLEARING
#ifndef MISTAKE_NO_WAIT
  waitUntilNotCalled(me, w);
#endif
#endif
#ifdef MISTAKE_FORGOTTEN_LATE
  freed[w] = true;
  forget(w)
#else
  forget(w);
  freed[w] = true
#endif
}

/* Layer::renew and freeOlderBlocks, with the lock held: a new block takes the widgets that are left over */
inline renew() {
  lastBlock++;
  i = 0;
  do
  :: i == block[current].used -> break
  :: else ->
     if
     :: block[current].place[i] != 0 ->
        block[lastBlock].place[block[lastBlock].used] = block[current].place[i];
        block[lastBlock].used++
     :: else
     fi;
     i++
  od;
  block[lastBlock].older = current;
  current = lastBlock;
  before = current;
  b = block[before].older;
  do
  :: b == 0 -> break
  :: else ->
     pins = 0;
     r = 0;
     do
     :: r == WALKERS -> break
     :: else -> pins = pins + (record[r].pinned == b -> 1 : 0); r++
     od;
#ifdef MISTAKE_PINNED_BLOCKS_FREED
     pins = 0;
#endif
     if
     :: pins > 0 -> before = b
     :: else -> block[before].older = block[b].older; block[b].freed = true
     fi;
     b = block[b].older
  od
}

/* What a handler does. In the circle, that of each thread deletes the next thread's widget. Where an address
 * is used again, the first widget's deletes its own one and waits until another has come there and gone. */
inline handler(me, w) {
  assert(!freed[w]);
#ifdef REUSE
  victim = 0;
  atomic {
    if
    :: w == 1 && !claimed[1] -> claimed[1] = true; victim = 1
    :: else
    fi
  };
  if
  :: victim == 1 -> deleteWidget(me, 1); answered
  :: else -> assert(!freed[w])
  fi
#else
#ifdef CIRCLE
  if
  :: w == me + 1 ->
     victim = (me + 1) % WALKERS + 1;
     atomic {
       if
       :: claimed[victim] -> victim = 0
       :: else -> claimed[victim] = true
       fi
     };
     if
     :: victim != 0 -> deleteWidget(me, victim)
     :: else
     fi
  :: else -> assert(!freed[w])
  fi
#else
  skip; /* it runs for a while */
  assert(!freed[w])
#endif
#endif
}

proctype walker(byte me) {
  byte mine, position, end, w, walks, met;
  byte r, i, b, at, seenTurn, seenThread, victim;
  bool circle;
  do
  :: walks == WALKS -> break
  :: else ->
     walks++;
     met = 0;
     mine = current;
     record[me].pinned = mine;
     record[me].thread = me;
#ifndef MISTAKE_PIN_WITHOUT_COMPARING
     do
     :: current == mine -> break
     :: else -> mine = current; record[me].pinned = mine
     od;
#endif
     assert(!block[mine].freed);
     end = block[mine].used;
     position = 0;
     do
     :: position == end -> break
     :: else ->
        assert(!block[mine].freed);
        w = block[mine].place[position];
        position++;
        if
        :: w == 0
#ifdef CIRCLE
        :: w != 0 && w != me + 1 /* it only meets its own, so that there are fewer states */
#endif
        :: else ->
#ifdef MISTAKE_CALLED_WITHOUT_COMPARING
           nextTurn(me, w);
           handler(me, w);
           met = met + (w == WIDGETS -> 1 : 0)
#else
#ifdef MISTAKE_COMPARED_BEFORE_PUBLISHING
           if
           :: block[mine].place[position - 1] == w -> nextTurn(me, w);
#else
           nextTurn(me, w);
           if
           :: block[mine].place[position - 1] == w ->
#endif
              handler(me, w);
              met = met + (w == WIDGETS -> 1 : 0)
           :: else
           fi
#endif
        fi
     od;
#ifndef CIRCLE
     /* One widget never leaves: no walk may skip it or meet it twice. */
     assert(met == 1);
#endif
     nextTurn(me, 0);
     record[me].thread = NOBODY;
     record[me].pinned = 0
  od
}

/* Deletes all widgets but the one that stays. */
proctype remover() {
  byte r, i, b, at, seenTurn, seenThread, w;
  bool circle;
  w = 1;
  do
  :: w == WIDGETS -> break
  :: else -> deleteWidget(REMOVER, w); w++
  od
}

/* A new widget gets the address of the first one as soon as that is free. */
proctype heir() {
  byte r, i, b, at, seenTurn, seenThread;
  bool circle;
  freed[1];
  freed[1] = false;
  acquire(layerLock);
  block[current].place[block[current].used] = 1;
  block[current].used++;
  release(layerLock);
  deleteWidget(REMOVER, 1);
  answered = true
}

/* Makes the layer wider, twice. */
proctype appender() {
  byte r, i, b, before, pins, times;
  do
  :: times == 2 -> break
  :: else -> acquire(layerLock); renew(); release(layerLock); times++
  od
}

init {
  atomic {
    byte n = 0;
    do
    :: n == WIDGETS -> break
    :: else -> block[1].place[n] = WIDGETS - n; n++
    od;
    block[1].used = n;
    n = 0;
    do
    :: n == WALKERS -> break
    :: else -> run walker(n); n++
    od;
#ifdef REUSE
    run heir()
#else
#ifndef CIRCLE
    run remover();
#ifdef RENEW
    run appender()
#endif
#endif
#endif
  }
}
