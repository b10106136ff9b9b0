
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity feedback is
   port ( A : in    std_logic; 
          B : in    std_logic; 
          N : in    std_logic; 
          P : out   std_logic; 
          Q : out   std_logic; 
          V : out   std_logic_vector (7 downto 0); 
          W : out   std_logic);
end feedback;

architecture BEHAVIORAL of feedback is
   signal P_DUMMY : std_logic;
   signal Q_DUMMY : std_logic;
   signal V_DUMMY : std_logic_vector (7 downto 0);
   signal N_DUMMY : std_logic;
   signal W_DUMMY : std_logic;
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
   component BUF4
      port ( D : in    std_logic_vector (3 downto 0); 
             Q : out   std_logic_vector (3 downto 0));
   end component;
   
   component PAD
      port ( I  : in    std_logic; 
             IO : inout std_logic);
   end component;
   
begin
   P <= P_DUMMY;
   Q <= Q_DUMMY;
   V(7 downto 0) <= V_DUMMY(7 downto 0);
   W <= W_DUMMY;
   N_DUMMY <= N;
   U1 : AND2
      port map (I0=>A,
                I1=>B,
                O=>Q_DUMMY);
   
   U2 : AND2
      port map (I0=>Q_DUMMY,
                I1=>A,
                O=>N_DUMMY);
   
   U3 : AND2
      port map (I0=>N_DUMMY,
                I1=>B,
                O=>W_DUMMY);
   
   U4 : AND2
      port map (I0=>A,
                I1=>B,
                O=>W_DUMMY);
   
   U5 : BUF4
      port map (D(3 downto 0)=>V_DUMMY(7 downto 4),
                Q(3 downto 0)=>V_DUMMY(3 downto 0));
   
   U6 : BUF4
      port map (D(3 downto 0)=>V_DUMMY(3 downto 0),
                Q(3 downto 0)=>V_DUMMY(7 downto 4));
   
   U7 : PAD
      port map (I=>V_DUMMY(0),
                IO=>P_DUMMY);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_feedback of  feedback is
   for BEHAVIORAL
      for U1, U2, U3, U4 : AND2
         use configuration WORK.CFG_AND2;
      end for;
      for U5, U6 : BUF4
         use configuration WORK.CFG_BUF4;
      end for;
      for U7 : PAD
         use configuration WORK.CFG_PAD;
      end for;
   end for;
end CFG_feedback;
-- synopsys translate_on

