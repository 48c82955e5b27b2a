// The contacts-writer program of this build as a child process: lines to its
// standard input, lines from its standard output, SIGKILL at any moment.
#pragma once

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <string>
#include <vector>

extern char** environ;

namespace ct::test {

class WriterProcess {
public:
	// Starts `contacts-writer ARGS...` on the store of $CONTACTS_DATA_DIR.
	explicit WriterProcess(const std::vector<std::string>& args)
	{
		int in[2], out[2];
		if (pipe2(in, O_CLOEXEC) != 0 || pipe2(out, O_CLOEXEC) != 0)
			return;
		posix_spawn_file_actions_t actions;
		posix_spawn_file_actions_init(&actions);
		posix_spawn_file_actions_adddup2(&actions, in[0], STDIN_FILENO);
		posix_spawn_file_actions_adddup2(&actions, out[1], STDOUT_FILENO);
		std::string program = binary();
		std::vector<char*> argv{ program.data() };
		std::vector<std::string> copies(args);
		for (std::string& a : copies)
			argv.push_back(a.data());
		argv.push_back(nullptr);
		if (posix_spawn(&m_pid, program.c_str(), &actions, nullptr, argv.data(), environ) != 0)
			m_pid = -1;
		posix_spawn_file_actions_destroy(&actions);
		close(in[0]);
		close(out[1]);
		m_in = in[1];
		m_out = out[0];
	}
	~WriterProcess()
	{
		if (m_pid > 0) {
			kill();
		}
		if (m_in >= 0)
			close(m_in);
		if (m_out >= 0)
			close(m_out);
	}
	WriterProcess(const WriterProcess&) = delete;
	WriterProcess& operator=(const WriterProcess&) = delete;

	static std::string binary()
	{
		const char* dir = getenv("CONTACTS_TEST_BIN_DIR");
		return std::string(dir ? dir : ".") + "/tools/contacts-writer";
	}

	bool started() const { return m_pid > 0; }

	void send(const std::string& line)
	{
		std::string text = line + "\n";
		ssize_t ignored = write(m_in, text.data(), text.size());
		(void)ignored;
	}

	// The next line, or "" when the writer ended or said nothing for
	// `maxSeconds` (a safety net against a hung writer, not a measurement).
	std::string readLine(double maxSeconds = 60.0)
	{
		for (;;) {
			size_t end = m_buffer.find('\n');
			if (end != std::string::npos) {
				std::string line = m_buffer.substr(0, end);
				m_buffer.erase(0, end + 1);
				return line;
			}
			pollfd p{ m_out, POLLIN, 0 };
			if (poll(&p, 1, static_cast<int>(maxSeconds * 1000)) <= 0 || !__readSome())
				return "";
		}
	}

	// Every complete line available now, without waiting.
	std::vector<std::string> readAvailable()
	{
		pollfd p{ m_out, POLLIN, 0 };
		while (poll(&p, 1, 0) > 0 && __readSome()) {
		}
		std::vector<std::string> lines;
		for (size_t end; (end = m_buffer.find('\n')) != std::string::npos;) {
			lines.push_back(m_buffer.substr(0, end));
			m_buffer.erase(0, end + 1);
		}
		return lines;
	}

	// SIGKILL, then reaps the process.
	void kill()
	{
		::kill(m_pid, SIGKILL);
		wait();
	}

	// Waits for the end; returns the exit code (-1 when killed by a signal).
	int wait()
	{
		if (m_pid <= 0)
			return m_exitCode;
		int status = 0;
		waitpid(m_pid, &status, 0);
		m_pid = -1;
		m_exitCode = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
		return m_exitCode;
	}

private:
	bool __readSome()
	{
		char chunk[4096];
		ssize_t n = read(m_out, chunk, sizeof(chunk));
		if (n <= 0)
			return false;
		m_buffer.append(chunk, static_cast<size_t>(n));
		return true;
	}

	pid_t m_pid = -1;
	int m_in = -1;
	int m_out = -1;
	int m_exitCode = -1;
	std::string m_buffer;
};

// Whether this is the long mode (make test-long).
inline bool longMode()
{
	const char* mode = getenv("CONTACTS_TEST_LONG");
	return mode && *mode && std::string(mode) != "0";
}

// The long mode runs `longCount` rounds, the suite `count`.
inline int rounds(int count, int longCount)
{
	return longMode() ? longCount : count;
}

} // namespace ct::test
