"""Running programs that may do anything: without root's rights, for a time, in a folder of their own."""

import os
import pathlib
import pwd
import resource
import shutil
import signal
import subprocess

MEMORY = 4 * 2**30


def nobody():
    return pwd.getpwnam("nobody") if os.geteuid() == 0 else None


def hand_over(*folders):
    if user := nobody():
        subprocess.run(["chown", "-R", f"{user.pw_uid}:{user.pw_gid}", *map(str, folders)], check=True)


class Sandbox:
    # Big matrices are sampled: what fails in them fails in many cells.
    ENVIRONMENT = {
        "PATH": "/usr/local/bin:/usr/bin:/bin",
        "LANG": "C.UTF-8",
        "QT_QPA_PLATFORM": "offscreen",
        "ZANDOR_SAMPLE": "97",
        "ZANDOR_STEPS": "4000",
        "ZANDOR_QUERIES": "60",
        "CCACHE_DISABLE": "1",
    }

    def __init__(self, home: pathlib.Path):
        self.home = home

    def run(self, command, limit, memory=MEMORY, **environment):
        """The output of a command, and whether it succeeded; one that takes too long has failed.

        `limit` is in seconds of a core, so that a busy machine makes no difference.
        """
        user = nobody()

        def become():
            os.setsid()
            os.umask(0o022)
            resource.setrlimit(resource.RLIMIT_CORE, (0, 0))
            resource.setrlimit(resource.RLIMIT_FSIZE, (2**36, 2**36))  # sparse files are large
            resource.setrlimit(resource.RLIMIT_AS, (memory, memory))
            resource.setrlimit(resource.RLIMIT_CPU, (limit, limit))
            if user:
                os.setgroups([])
                os.setgid(user.pw_gid)
                os.setuid(user.pw_uid)

        shutil.rmtree(self.home, ignore_errors=True)
        self.home.mkdir(parents=True)
        hand_over(self.home)
        surroundings = {**self.ENVIRONMENT, "HOME": str(self.home), "TMPDIR": str(self.home),
                        "XDG_RUNTIME_DIR": str(self.home), **environment}
        child = subprocess.Popen(
            list(map(str, command)), cwd=self.home, env=surroundings, preexec_fn=become,
            stdin=subprocess.DEVNULL, stdout=subprocess.PIPE, stderr=subprocess.STDOUT)
        try:
            output, _ = child.communicate(timeout=10 * limit)
        except subprocess.TimeoutExpired:
            os.killpg(child.pid, signal.SIGKILL)
            child.communicate()
            return "took too long", False
        return output.decode(errors="replace"), child.returncode == 0
